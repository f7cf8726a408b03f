// Random choices. A failure tells their seed, and TESSAL_TEST_SEED=<seed> repeats the run that failed.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <random>
#include <string>
#include <string_view>

class Chance {
public:
    std::size_t below(std::size_t limit) { return m_random() % limit; }
    bool coin() { return below(2) != 0; }
    /// Up to the limit, often at a border of words.
    std::size_t size(std::size_t limit) {
        const std::size_t border = 64 * below(limit / 64 + 1) + below(3);
        return coin() ? below(limit + 1) : std::min(limit, border > 0 ? border - 1 : 0);
    }
    std::string bytes(std::size_t count) {
        std::string bytes(count, '\0');
        std::generate(bytes.begin(), bytes.end(), [this] { return static_cast<char>(m_random()); });
        return bytes;
    }
    /// Hex digits or only 0 and 1, among which other characters may stand.
    std::string digits(std::size_t count) {
        const std::string_view alphabet = coin() ? "0123456789abcdefABCDEF" : "01";
        const std::size_t foreignPercent = coin() ? 10 : 0;
        std::string text(count, ' ');
        for (char& character : text) {
            const bool isForeign = below(100) < foreignPercent;
            character = isForeign ? static_cast<char>(1 + below(255)) : alphabet[below(alphabet.size())];
        }
        return text;
    }

private:
    static unsigned seed() {
        const char* const given = std::getenv("TESSAL_TEST_SEED");
        return given != nullptr ? static_cast<unsigned>(std::stoul(given)) : std::random_device()();
    }

    const unsigned m_seed = seed();
    std::mt19937_64 m_random{m_seed};
    const testing::ScopedTrace m_trace{__FILE__, __LINE__, "TESSAL_TEST_SEED=" + std::to_string(m_seed)};
};
