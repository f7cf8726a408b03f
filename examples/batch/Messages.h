// Where the library's messages go while the prompt runs.
#pragma once

#include <TessalUtility.h>

#include <string>

/// Takes the library's messages while it lives: status texts go to standard output, the others to standard error with
/// the place in the script before them. The two streams stay in step. Usage lines are for a person who types.
class Messages {
public:
    /// @param source name of the script; empty where messages have no place
    explicit Messages(std::string source);
    Messages(const Messages&) = delete;
    Messages& operator=(const Messages&) = delete;
    ~Messages();

    /// The line that is being worked on.
    void setLine(int number) { m_line = number; }

    /// Says something about the current line.
    void say(const std::string& text) const;
    /// Says something about the script as a whole.
    void sayOfAll(const std::string& text) const;

private:
    static void take(const HkMessage& message, void* context);
    void write(const std::string& place, const char* text) const;
    std::string place() const;

    std::string m_source;
    int m_line = 0;
    bool m_isTraced;
};
