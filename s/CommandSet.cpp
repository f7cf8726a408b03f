#include "CommandSet.h"

#include <algorithm>
#include <array>
#include <cassert>
#include <cstdint>
#include <cstring>
#include <limits>
#include <memory>
#include <new>
#include <string>
#include <utility>

#include "HkStr.h"
#include "HkString.h"
#include "TessalException.h"
#include "UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/CommandSet", "$Revision: 1.1 $"};

constexpr int maxCapacity = std::numeric_limits<int>::max();

/// True for the characters that a bare word is made of: all but separators, the double quote and the terminator.
constexpr std::array<bool, 256> makeWordTable() {
    std::array<bool, 256> table{};
    for (bool& isWord : table) {
        isWord = true;
    }
    for (const char other : {'\0', '\t', '\n', '\r', ' ', '"'}) {
        table[static_cast<unsigned char>(other)] = false;
    }
    return table;
}

constexpr std::array<bool, 256> wordTable = makeWordTable();

const char* endOfWord(const char* place) {
    while (wordTable[static_cast<unsigned char>(*place)]) {
        ++place;
    }
    return place;
}

/// The quote that closes the quotation whose text begins at @p text.
const char* closingQuote(const char* text) {
    const char* const place = std::strchr(text, '"');
    if (place == nullptr) {
        origin.report().issueInfo("Missing closing quotation mark %s.\n", text);
        origin.raise<DataMismatchException>();
    }
    return place;
}

/// Calls @p visit with the index of each token that is a position, in order, until it yields false.
template <class Visit>
bool visitPositions(const CommandSet& commands, Visit visit) {
    bool inPositions = false;
    for (int i = 0; i < commands.getNumberCommands(); ++i) {
        const char* const token = commands.getCommand(i);
        if (token[0] == '-') {
            inPositions = HkStr::ICompare(token, "-p") == 0 || HkStr::ICompare(token, "-position") == 0;
        } else if (inPositions && !visit(i, token)) {
            return false;
        }
    }
    return true;
}

/// Stores value + step; a sum past 32 bits stays at the limit.
void resetPosition(CommandSet& commands, int index, std::int32_t value, int step) {
    const std::int64_t sum = std::int64_t{value} + step;
    const std::int64_t limited = std::clamp<std::int64_t>(sum, std::numeric_limits<std::int32_t>::min(),
                                                          std::numeric_limits<std::int32_t>::max());
    commands.resetCommand(index, HkString().Format("%d", static_cast<int>(limited)));
}

}  // namespace

CommandSet::CommandSet(int capacity)
    : m_count(0), m_capacity(std::max(capacity, 1)), m_tokens(new char*[static_cast<std::size_t>(m_capacity)]) {
    assert(capacity >= 1);
}

CommandSet::CommandSet(const CommandSet& other) : CommandSet(other.m_capacity) {
    for (int i = 0; i < other.m_count; ++i) {
        addCommand(other.m_tokens[i]);
    }
}

CommandSet& CommandSet::operator=(const CommandSet& other) {
    CommandSet copy(other);
    std::swap(m_count, copy.m_count);
    std::swap(m_capacity, copy.m_capacity);
    std::swap(m_tokens, copy.m_tokens);
    return *this;
}

CommandSet::~CommandSet() {
    for (int i = 0; i < m_count; ++i) {
        delete[] m_tokens[i];
    }
    delete[] m_tokens;
}

void CommandSet::grow() {
    if (m_capacity > maxCapacity / 2) {
        throw std::bad_array_new_length();
    }
    char** const larger = new char*[static_cast<std::size_t>(m_capacity) * 2];
    std::copy_n(m_tokens, m_count, larger);
    delete[] m_tokens;
    m_tokens = larger;
    m_capacity *= 2;
}

/// Appends a copy of the characters from @p first up to @p last.
void CommandSet::append(const char* first, const char* last) {
    if (m_count == m_capacity) {
        grow();
    }
    const auto length = static_cast<std::size_t>(last - first);
    char* const token = new char[length + 1];
    std::memcpy(token, first, length);
    token[length] = '\0';
    m_tokens[m_count] = token;
    ++m_count;
}

void CommandSet::addCommand(const char* token) {
    if (m_count == m_capacity) {
        grow();
    }
    m_tokens[m_count] = HkStr::Dup(token);
    ++m_count;
}

void CommandSet::addCommand(int value) {
    addCommand(HkString().Format("%d", value));
}

const char* CommandSet::getCommand(int index) const {
    assert(index >= 0);
    return index >= 0 && index < m_count ? m_tokens[index] : nullptr;
}

void CommandSet::resetCommand(int index, const char* token) {
    assert(index >= 0);
    if (index < 0 || index >= m_count) {
        origin.raise<OutOfRangeException>();
    }
    char* const copy = HkStr::Dup(token);
    delete[] m_tokens[index];
    m_tokens[index] = copy;
}

void CommandSet::printCommands(bool info) const {
    if (!info && !HkMessageManager::isDebugHeard()) {
        return;
    }
    std::string line;
    for (int i = 0; i < m_count; ++i) {
        line.append(m_tokens[i]).append(1, ' ');
    }
    if (info) {
        origin.report().issueInfo("Command: %s\n", line.c_str());
    } else {
        HkMessageManager::debugStub("Command: %s\n", line.c_str());
    }
}

CommandSet* CommandSet::string2CommandSet(const char* line) {
    if (line == nullptr || line[0] == '#') {
        return nullptr;
    }
    auto commands = std::make_unique<CommandSet>();
    for (const char* place = line; *place != '\0';) {
        const char* const word = place;
        place = endOfWord(word);
        if (*place == '"') {
            const char* const text = place + 1;
            const char* const close = closingQuote(text);
            // An empty pair of quotes counts only behind dropped letters, and never as the command word.
            if (close != text || (place != word && commands->m_count > 0)) {
                commands->append(text, close);
            }
            place = close + 1;
        } else {
            if (place != word) {
                commands->append(word, place);
            }
            place += *place != '\0' ? 1 : 0;
        }
    }
    return commands->m_count > 0 ? commands.release() : nullptr;
}

bool CommandSet::incrementPositions() {
    return visitPositions(*this, [this](int index, const char* token) {
        resetPosition(*this, index, HkStr::AToL(token), 1);
        return true;
    });
}

bool CommandSet::decrementPositions() {
    return visitPositions(*this, [this](int index, const char* token) {
        const std::int32_t value = HkStr::AToL(token);
        if (value == 0) {
            const bool isNumber = HkStr::IsDigit(static_cast<unsigned char>(token[0])) != 0;
            origin.report().issueInfo(
                "%s", isNumber ? "Position should start from 1.\n" : "Expect an integer after -p|-position.\n");
            return false;
        }
        resetPosition(*this, index, value, -1);
        return true;
    });
}
