#include "ByteProgress.h"

#include <TessalUtility.h>

#include <algorithm>

#include "ProgressBar.h"

namespace {

constexpr int steps = 100;  // no finer: the filter before the function lets one report for each percent through

}  // namespace

ByteProgress::ByteProgress(const char* title, std::uint64_t total) : m_total(total) {
    ProgressBar::expectBytes(total);
    ProgressInterfaceClass::startProgressUpdate(steps, title);
}

ByteProgress::~ByteProgress() {
    if (m_done == m_total) {
        ProgressInterfaceClass::endProgressUpdate();
    } else {
        ProgressInterfaceClass::stopProgressUpdate();
    }
}

void ByteProgress::add(std::uint64_t bytes) {
    m_done += std::min(bytes, m_total - m_done);
    const double share = m_total == 0 ? 0 : static_cast<double>(m_done) / static_cast<double>(m_total);
    const int reached = static_cast<int>(share * steps);
    if (reached > m_reported) {
        m_reported = reached;
        ProgressInterfaceClass::getCBData()->setCurrentCount(reached - 1);
        ProgressInterfaceClass::updateProgress();
    }
}
