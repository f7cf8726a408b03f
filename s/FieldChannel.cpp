#include "s/FieldChannel.h"

#include <cstring>
#include <limits>

#include "HkStr.h"
#include "WireForm.h"

namespace {

/// A string up to this size goes out in one call with its length: two calls meet the peer's delayed acknowledgement.
constexpr int togetherSize = 8192;

int cappedLength(const char* text) {
    constexpr std::size_t longest = std::numeric_limits<int>::max();
    const std::size_t length = HkStr::Len(text);
    return static_cast<int>(length < longest ? length : longest);
}

}  // namespace

void FieldChannel::report(const char* text) const {
    if (text != nullptr) {
        m_reports.origin.report().issueStatus(text, m_error);
    }
}

bool FieldChannel::read(char* data, int length) {
    int done = 0;
    while (done < length) {
        const std::int64_t moved = data != nullptr ? receiveSome(data + done, length - done) : 0;
        if (moved <= 0) {
            m_error = moved < 0 ? failure() : 0;
            report(m_reports.receiveFailed);
            return false;
        }
        done += static_cast<int>(moved);
    }
    return true;
}

/// How many of the bytes went out: all, or fewer after a failure.
int FieldChannel::sent(const char* data, int length) {
    int done = 0;
    while (done < length) {
        const std::int64_t moved = data != nullptr ? sendSome(data + done, length - done) : 0;
        if (moved <= 0) {
            m_error = moved < 0 ? failure() : 0;
            report(m_reports.sendFailed);
            break;
        }
        done += static_cast<int>(moved);
    }
    return done;
}

bool FieldChannel::write(const char* data, int length) {
    return length < 1 || sent(data, length) == length;
}

int FieldChannel::readInt(int* value) {
    char bytes[WireForm::intSize] = {};
    const bool complete = read(bytes, sizeof bytes);
    if (value != nullptr) {
        *value = complete ? WireForm::loadInt(bytes) : 0;
    }
    return WireForm::intSize;
}

int FieldChannel::writeInt(int value) {
    char bytes[WireForm::intSize];
    WireForm::storeInt(bytes, value);
    return write(bytes, sizeof bytes) ? WireForm::intSize : 0;
}

bool FieldChannel::readBool(bool* value) {
    char byte = 0;
    if (!read(&byte, 1)) {
        return false;
    }
    if (value != nullptr) {
        *value = WireForm::loadBool(byte);
    }
    return true;
}

bool FieldChannel::writeBool(bool value) {
    const char byte = value ? 1 : 0;
    return write(&byte, 1);
}

/// Sends length and text; true when the text's bytes went out. A failure before the text begins does not keep the text
/// from being tried.
bool FieldChannel::writeTogether(int length, const char* text) {
    char form[WireForm::intSize + togetherSize];
    WireForm::storeInt(form, length);
    std::memcpy(form + WireForm::intSize, text, static_cast<std::size_t>(length));
    const int total = WireForm::intSize + length;
    const int done = sent(form, total);
    return done == total || (done < WireForm::intSize && write(text, length));
}

int FieldChannel::writeString(const char* text) {
    const int length = cappedLength(text);
    bool complete = true;
    if (length > 0 && length <= togetherSize) {
        complete = writeTogether(length, text);
    } else {
        writeInt(length);
        complete = write(text, length);
    }
    if (!complete) {
        report(m_reports.textFailed);
    }
    return length;
}

bool FieldChannel::readSocket(char* data, int length) {
    const bool complete = read(data, length);
    if (!complete) {
        report(m_reports.receivedNothing);
    }
    return complete;
}

bool FieldChannel::writeSocket(const char* data, int length) {
    const bool complete = write(data, length);
    if (!complete) {
        report(m_reports.sentNothing);
    }
    return complete;
}
