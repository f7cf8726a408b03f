// How far the writing of a run's files is.
#pragma once

#include <algorithm>
#include <climits>
#include <cstdint>
#include <string>

#include "ProgressInterfaceClass.h"

namespace ImageTools {

/// Reports the writing through the library's progress interface while it lives, a step for each block that a sink sends
/// on.
class WriteProgress {
public:
    WriteProgress(const std::string& title, std::uint64_t blocks) {
        const auto steps = static_cast<int>(std::min<std::uint64_t>(blocks, INT_MAX));
        ProgressInterfaceClass::startProgressUpdate(steps, title.c_str());
    }
    WriteProgress(const WriteProgress&) = delete;
    WriteProgress& operator=(const WriteProgress&) = delete;
    /// Without complete() the run has failed.
    ~WriteProgress() {
        if (!m_isDone) {
            ProgressInterfaceClass::stopProgressUpdate();
        }
    }

    /// The files are there.
    void complete() {
        m_isDone = true;
        ProgressInterfaceClass::endProgressUpdate();
    }

    /// One block more. The number of blocks is estimated, so the last step is left to the end.
    static void step() {
        const Callback* const record = ProgressInterfaceClass::getCBData();
        if (record != nullptr && record->getCurrentCount() + 1 < record->getTotalCount()) {
            ProgressInterfaceClass::updateProgress();
        }
    }

private:
    bool m_isDone = false;
};

}  // namespace ImageTools
