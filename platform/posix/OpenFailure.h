// Why the calling thread's last open, create or duplicate failed, in words for the user.
#pragma once

namespace OpenFailure {

/// Keeps the failed call, its errno and what the user may do about it.
void noteHostCall();

/// Keeps that the opening lock's holder, process @p holder, stands still.
void noteBusy(int holder);

/// Keeps these words.
void note(const char* words);

const char* words();

}  // namespace OpenFailure
