// Collects what the library reports while it lives, and restores the default output afterwards.
#pragma once

#include <string>
#include <vector>

#include "HkMessageManager.h"

struct RecordedMessage {
    HkMessageLevel level;
    std::string file;
    std::string text;
};

class MessageRecorder {
public:
    MessageRecorder() { HkMessageManager::setHandler(&MessageRecorder::take, this); }
    ~MessageRecorder() { HkMessageManager::setHandler(nullptr, nullptr); }
    MessageRecorder(const MessageRecorder&) = delete;
    MessageRecorder& operator=(const MessageRecorder&) = delete;

    const std::vector<RecordedMessage>& all() const { return m_messages; }

    /// The texts of one level, in order.
    std::vector<std::string> texts(HkMessageLevel level) const {
        std::vector<std::string> result;
        for (const RecordedMessage& message : m_messages) {
            if (message.level == level) {
                result.push_back(message.text);
            }
        }
        return result;
    }
    std::vector<std::string> status() const { return texts(HkMessageLevel::Status); }
    std::vector<std::string> info() const { return texts(HkMessageLevel::Info); }
    std::vector<std::string> errors() const { return texts(HkMessageLevel::Error); }
    std::vector<std::string> debug() const { return texts(HkMessageLevel::Debug); }

    void clear() { m_messages.clear(); }

private:
    static void take(const HkMessage& message, void* context) {
        static_cast<MessageRecorder*>(context)->m_messages.push_back(
            {message.level, message.file != nullptr ? message.file : "", message.text});
    }

    std::vector<RecordedMessage> m_messages;
};
