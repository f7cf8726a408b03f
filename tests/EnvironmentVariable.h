// Sets an environment variable, or takes it away, while it lives.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>

class EnvironmentVariable {
public:
    /// @param value UTF-8; null takes the variable away
    EnvironmentVariable(std::string name, const char* value) : m_name(std::move(name)) {
        if (const char* const former = std::getenv(m_name.c_str())) {
            m_former = former;
        }
        set(value);
    }
    ~EnvironmentVariable() { set(m_former ? m_former->c_str() : nullptr); }
    EnvironmentVariable(const EnvironmentVariable&) = delete;
    EnvironmentVariable& operator=(const EnvironmentVariable&) = delete;

    void set(const char* value) {
#if defined(_WIN32)
        const auto wide = [](const char* text) { return std::filesystem::u8path(text).wstring(); };
        // This host takes an empty variable away.
        _wputenv_s(wide(m_name.c_str()).c_str(), wide(value != nullptr ? value : "").c_str());
#else
        value != nullptr ? ::setenv(m_name.c_str(), value, 1) : ::unsetenv(m_name.c_str());
#endif
    }

private:
    std::string m_name;
    std::optional<std::string> m_former;
};
