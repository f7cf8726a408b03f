// The origin of a unit's reports and throws, given in one place of each unit:
//
//     namespace { constexpr UnitOrigin origin{"../s/CommandSet", "$Revision: 1.8 $"}; }
//     ...
//     origin.report().issueInfo("Missing closing quotation mark %s.\n", text);
//     origin.raise<DataMismatchException>();
#pragma once

#include "HkMessageManager.h"

struct UnitOrigin {
    const char* file;
    const char* revision;

    /// The reporting object with this origin and the caller's line, for one issue call.
    HkMessageManager& report(int line = __builtin_LINE()) const {
        return HkMessageManager::createObject(module, file, line, revision);
    }

    /// Throws the exception with this origin and the caller's line.
    template <class Exception>
    [[noreturn]] void raise(int line = __builtin_LINE()) const {
        throw Exception(module, file, revision, line);
    }

    static constexpr const char* module = "tESSAL";
};
