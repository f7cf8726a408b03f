#include "ChildProcess.h"

std::string ChildProcess::read() {
    const auto end = Clock::now() + patience;
    std::size_t length = 0;
    while ((length = m_received.find('\n')) == std::string::npos) {
        if (!receive(m_received, end)) {
            return "(nothing)";
        }
    }
    std::string line = m_received.substr(0, length);
    m_received.erase(0, length + 1);
    if (!line.empty() && line.back() == '\r') {
        line.pop_back();
    }
    return line;
}
