// The Win32 calls that the named semaphores make. Tests replace single ones to see what a failing or another host does.
#pragma once

#include <windows.h>

struct SemaphoreCalls {
    decltype(&::OpenSemaphoreA) openSemaphore = &::OpenSemaphoreA;
    decltype(&::CreateSemaphoreA) createSemaphore = &::CreateSemaphoreA;
    decltype(&::WaitForSingleObject) waitForSingleObject = &::WaitForSingleObject;
    decltype(&::ReleaseSemaphore) releaseSemaphore = &::ReleaseSemaphore;
    decltype(&::CloseHandle) closeHandle = &::CloseHandle;
};

extern SemaphoreCalls semaphoreCalls;
