#include "ChildProcess.h"

#include "HostChild.h"

ChildProcess::ChildProcess() = default;
ChildProcess::~ChildProcess() = default;
ChildProcess::ChildProcess(ChildProcess&&) noexcept = default;
ChildProcess& ChildProcess::operator=(ChildProcess&&) noexcept = default;

ChildProcess::ChildProcess(const std::string& role, const std::vector<std::string>& arguments) {
    std::vector<std::string> words{"child", "--role", role};
    words.insert(words.end(), arguments.begin(), arguments.end());
    m_child = HostChild::start(std::move(words));
}

void ChildProcess::write(const std::string& line) {
    m_child->send(line + "\n");
}

std::string ChildProcess::read() {
    const auto end = HostChild::Clock::now() + HostChild::patience;
    std::size_t length = 0;
    while ((length = m_received.find('\n')) == std::string::npos) {
        if (!m_child->receive(m_received, end)) {
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

void ChildProcess::kill() {
    m_child->kill();
}

int ChildProcess::wait() {
    return m_child->wait();
}

long ChildProcess::id() const {
    return m_child->id();
}
