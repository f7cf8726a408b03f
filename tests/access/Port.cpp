#include "Port.h"

#include <chrono>
#include <iostream>
#include <stdexcept>

#include "host/Role.h"

namespace {

int answer(Access& access, const std::string& line) {
    return line == "lock"  ? static_cast<int>(access.lock())
           : line == "dec" ? access.decCount()
                           : access.getNormalizedCount();
}

const Role portUser{"port user", [](const RoleArguments& arguments) {
                        Access access(std::stoi(arguments.at(0)),
                                      static_cast<Access::ACCESS_TYPE>(std::stoi(arguments.at(1))));
                        std::cout << "open" << std::endl;
                        for (std::string line; std::getline(std::cin, line);) {
                            std::cout << answer(access, line) << std::endl;
                        }
                        return 0;
                    }};

}  // namespace

std::unique_ptr<ChildProcess> startPortUser(int port, Access::ACCESS_TYPE type) {
    auto process = ChildProcess::start("port user", {std::to_string(port), std::to_string(type)});
    if (process->read() != "open") {
        throw std::runtime_error("the child did not open its port");
    }
    return process;
}

int freshPort() {
    // A range of a thousand ids for each microsecond at which a test may start.
    static const auto start = std::chrono::system_clock::now().time_since_epoch();
    static const auto range = std::chrono::duration_cast<std::chrono::microseconds>(start).count() % 1000000;
    static int next = static_cast<int>(range) * 1000 + 10000;
    return ++next;
}

bool isFree(int port) {
    Access access(port, Access::SHARE);
    return access.lock();
}
