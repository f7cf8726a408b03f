// A directory of a test's own, below testing::TempDir(), which goes away with all that is in it.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>

#include "HkFile.h"

class TemporaryDirectory {
public:
    TemporaryDirectory() {
        std::random_device random;
        do {
            // With "/" on every host, as messages show paths.
            m_path =
                std::filesystem::u8path(testing::TempDir()).generic_u8string() + "tessal-" + std::to_string(random());
        } while (!HkFile::mkdir(m_path.c_str(), false) && HkFile::exist(m_path.c_str()));
    }
    ~TemporaryDirectory() { HkFile::rmtree(m_path.c_str()); }
    TemporaryDirectory(const TemporaryDirectory&) = delete;
    TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

    const std::string& path() const { return m_path; }
    /// The path of an entry; the name may hold separators.
    std::string operator/(const std::string& name) const { return m_path + "/" + name; }

    /// Makes a directory with those above it and gives its path.
    std::string make(const std::string& name) const {
        HkFile::mkdir((*this / name).c_str(), true);
        return *this / name;
    }
    /// Writes a file, with the directories above it, and gives its path.
    std::string write(const std::string& name, const std::string& content) const {
        if (const std::size_t end = name.rfind('/'); end != std::string::npos) {
            make(name.substr(0, end));
        }
        std::ofstream(std::filesystem::u8path(*this / name), std::ios::binary) << content;
        return *this / name;
    }
    std::string read(const std::string& name) const {
        std::ifstream file(std::filesystem::u8path(*this / name), std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }

private:
    std::string m_path;
};
