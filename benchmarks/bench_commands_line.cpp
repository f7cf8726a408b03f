// A batch line into tokens: a typical line of 20 tokens, and one of 1 MiB.

#include <cstring>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "benchmarks/Item.h"

#if __has_include(<boost/tokenizer.hpp>)
#include <boost/tokenizer.hpp>
#endif

namespace {

using Words = std::vector<std::string>;

const std::string& line20() {
    static const std::string line =
        "program -p 1 -file \"C:/projects/board 7/prom image.mcs\" -e -v -u 1A2B3C4D -key C:/projects/keys/device.key "
        "-ver 0\t-defaultVersion 2  -dataWidth 16 -loadfpga -master -internalClk\r\n";
    return line;
}

const std::string& line1MiB() {
    static const std::string line = [] {
        std::string text;
        while (text.size() + line20().size() < (std::size_t{1} << 20)) {
            text.append(line20(), 0, line20().size() - 2).append(" ");
        }
        return text;
    }();
    return line;
}

// Ours.

Words splitByOurs(const std::string& line) {
    const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line.c_str()));
    return Words(commands->getCommands(), commands->getCommands() + commands->getNumberCommands());
}

template <const std::string& (*line)()>
void requireAgreement();

template <const std::string& (*line)()>
void ours(benchmark::State& state) {
    requireAgreement<line>();
    const char* text = line().c_str();
    for (auto step : state) {
        benchmark::DoNotOptimize(text);
        const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(text));
        benchmark::DoNotOptimize(commands->getCommands());
    }
}

// What the other sides make: an array of tokens, one block each, as the set holds them.

class OwnedTokens {
public:
    OwnedTokens() = default;
    OwnedTokens(const OwnedTokens&) = delete;
    OwnedTokens& operator=(const OwnedTokens&) = delete;
    ~OwnedTokens() {
        for (char* const token : m_tokens) {
            delete[] token;
        }
    }
    void add(const char* first, const char* last) {
        const auto length = static_cast<std::size_t>(last - first);
        char* const token = static_cast<char*>(std::memcpy(new char[length + 1], first, length));
        token[length] = '\0';
        m_tokens.push_back(token);
    }
    char** data() { return m_tokens.data(); }
    Words words() const { return Words(m_tokens.begin(), m_tokens.end()); }

private:
    std::vector<char*> m_tokens;
};

// Limit: one scan by the plainest means.

bool isBlank(char ch) {
    return ch == ' ' || ch == '\t' || ch == '\r' || ch == '\n';
}

void splitByScan(const char* place, OwnedTokens& tokens) {
    while (*place != '\0') {
        if (isBlank(*place)) {
            ++place;
        } else if (*place == '"') {
            const char* const text = ++place;
            while (*place != '"' && *place != '\0') {
                ++place;
            }
            tokens.add(text, place++);
        } else {
            const char* const text = place;
            while (!isBlank(*place) && *place != '\0') {
                ++place;
            }
            tokens.add(text, place);
        }
    }
}

template <const std::string& (*line)()>
void limit(benchmark::State& state) {
    const char* text = line().c_str();
    for (auto step : state) {
        benchmark::DoNotOptimize(text);
        OwnedTokens tokens;
        splitByScan(text, tokens);
        benchmark::DoNotOptimize(tokens.data());
    }
}

template <const std::string& (*line)()>
bool agreesWithLimit() {
    OwnedTokens tokens;
    splitByScan(line().c_str(), tokens);
    return tokens.words() == splitByOurs(line());
}

// Peer: the same separators and quotes, repeated separators dropped, the tokens owned.

#if __has_include(<boost/tokenizer.hpp>)

void splitByBoost(const std::string& line, OwnedTokens& tokens) {
    const boost::escaped_list_separator<char> rules("", " \t\r\n", "\"");
    for (const std::string& word : boost::tokenizer<boost::escaped_list_separator<char>>(line, rules)) {
        if (!word.empty()) {
            tokens.add(word.data(), word.data() + word.size());
        }
    }
}

template <const std::string& (*line)()>
void boostPeer(benchmark::State& state) {
    for (auto step : state) {
        OwnedTokens tokens;
        splitByBoost(line(), tokens);
        benchmark::DoNotOptimize(tokens.data());
    }
}

template <const std::string& (*line)()>
std::vector<Side> peers() {
    return {{"boost tokenizer", boostPeer<line>}};
}

template <const std::string& (*line)()>
bool agreesWithPeers() {
    OwnedTokens tokens;
    splitByBoost(line(), tokens);
    return tokens.words() == splitByOurs(line());
}

#else

template <const std::string& (*line)()>
std::vector<Side> peers() {
    return {};
}

template <const std::string& (*line)()>
bool agreesWithPeers() {
    return true;
}

#endif

/// All sides give the same tokens; asked once, before the clock runs.
template <const std::string& (*line)()>
void requireAgreement() {
    static const bool agrees = agreesWithPeers<line>() && agreesWithLimit<line>();
    if (!agrees) {
        throw std::logic_error("the sides give different tokens");
    }
}

template <const std::string& (*line)()>
Item itemOf(const char* name, double peerGoal, double limitGoal) {
    return {name,     {"CommandSet", ours<line>}, peers<line>(), {"one scan, owned tokens", limit<line>}, peerGoal,
            limitGoal};
}

const RegisterItem shortLine{itemOf<line20>("tokenise_20_tokens", 0.35, 1.15)};
const RegisterItem longLine{itemOf<line1MiB>("tokenise_1_mib", 0.65, 1.10)};

}  // namespace
