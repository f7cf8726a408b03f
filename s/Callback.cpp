#include "Callback.h"

#include <chrono>

#include "s/ProgressClock.h"
#include "s/RecordReader.h"
#include "s/RecordWriter.h"

namespace {

constexpr int longSilence = 11000;  // milliseconds: more than 10 whole seconds

using Clock = std::chrono::steady_clock;

/// When the library was loaded, and a little earlier, so that no tick is 0: that stands for a silence not yet begun.
const Clock::time_point start = Clock::now() - std::chrono::milliseconds(1);

int realTicks() {
    const auto passed = std::chrono::duration_cast<std::chrono::milliseconds>(Clock::now() - start);
    return static_cast<int>(static_cast<unsigned int>(passed.count()));
}

ProgressClock replacedClock = nullptr;

/// When the silence began that lets an update of the same percent through; shared by all functions.
int lastClock = 0;

int ticks() {
    return replacedClock != nullptr ? replacedClock() : realTicks();
}

int difference(int later, int earlier) {
    return static_cast<int>(static_cast<unsigned int>(later) - static_cast<unsigned int>(earlier));
}

/// 32-bit arithmetic that wraps, truncating. The total is not 0.
int percentOf(int current, int total) {
    const unsigned int hundredfold = static_cast<unsigned int>(current) * 100U;
    return total != -1 ? static_cast<int>(hundredfold) / total : static_cast<int>(0U - hundredfold);
}

}  // namespace

void setProgressClock(ProgressClock clock) {
    replacedClock = clock;
    lastClock = 0;
}

// The copy's id is 0.
Callback::Callback(const Callback& other)  // NOLINT(bugprone-copy-constructor-init)
    : Streamable(),
      m_totalCount(other.m_totalCount),
      m_currentCount(other.m_currentCount),
      m_progressStatus(other.m_progressStatus),
      m_callbackText(other.m_callbackText),
      m_promptText(other.m_promptText),
      m_mode(other.m_mode),
      m_subMode(other.m_subMode) {}

void Callback::readStream(std::istream& in) {
    RecordReader record(in);
    record.readInt(m_totalCount);
    record.readInt(m_currentCount);
    record.readInt(m_progressStatus);
}

void Callback::writeStream(std::ostream& out) {
    RecordWriter record(out);
    record.addInt(m_totalCount);
    record.addInt(m_currentCount);
    record.addInt(m_progressStatus);
    record.addLine(m_callbackText);
    record.finish();
}

bool CallbackFunction::callFunction(Callback& record) {
    const int now = ticks();
    if (lastClock == 0) {
        lastClock = now;
    }
    if (m_function == nullptr) {
        return false;
    }
    if (record.getProgressStatus() == PROGRESS_UPDATE) {
        const int total = record.getTotalCount();
        if (total == 0 || isHeldBack(percentOf(record.getCurrentCount(), total), now)) {
            return false;
        }
    }
    return m_function(record);
}

bool CallbackFunction::isHeldBack(int percent, int now) {
    if (difference(now, lastClock) >= longSilence) {
        lastClock = now;
        return false;
    }
    if (percent == m_lastPercent) {
        lastClock = now;
        return true;
    }
    m_lastPercent = percent;
    return false;
}
