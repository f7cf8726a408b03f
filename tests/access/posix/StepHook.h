// Acts at the n-th host call that this process makes from now on.
#pragma once

#include <string>

namespace StepHook {

enum class Action { Kill, Stop, Fail };

/// At host call number @p step, counted from 1 and, unless @p call is null, among the calls of this name only.
void arm(Action action, int step, const char* call = nullptr, int error = 0);
void disarm();

}  // namespace StepHook
