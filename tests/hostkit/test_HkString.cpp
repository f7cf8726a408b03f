#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <map>
#include <random>
#include <stdexcept>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "HkString.h"

namespace {

std::uint32_t lengthWord(const HkString& text) {
    const char* pointer = nullptr;
    std::memcpy(&pointer, &text, sizeof pointer);
    std::uint32_t length = 0;
    std::memcpy(&length, pointer - 4, sizeof length);
    return length;
}

void expectIs(const HkString& text, const std::string& expected) {
    ASSERT_EQ(text.view(), expected);
    EXPECT_EQ(lengthWord(text), expected.size());
    EXPECT_EQ(text.c_str()[expected.size()], '\0');
}

// Lengths about the places where a text changes its kind of memory.
const std::size_t telling[] = {0, 1, 2, 3, 4, 7, 8, 15, 16, 30, 31, 32, 33, 64, 1000, 1 << 20};

std::string sample(std::size_t length) {
    std::string text(length, '\0');
    for (std::size_t i = 0; i < length; ++i) {
        text[i] = static_cast<char>('a' + i % 23);
    }
    return text;
}

TEST(HkString, IsOnePointerWithTheLengthWordBeforeTheText) {
    static_assert(sizeof(HkString) == sizeof(char*));
    for (const std::size_t length : telling) {
        expectIs(HkString(sample(length).c_str()), sample(length));
    }
    expectIs(HkString(std::string_view("a\0b", 3)), std::string("a\0b", 3));
}

TEST(HkString, IsNeverNull) {
    HkString emptied("some text");
    emptied.Empty();
    HkString assigned("some text");
    assigned = nullptr;
    HkString moved("some text");
    const HkString taken(std::move(moved));
    for (const HkString& text : {HkString(), HkString(nullptr), HkString(""), emptied, assigned, moved}) {
        expectIs(text, "");
        EXPECT_EQ(text, HkString());
    }
    expectIs(taken, "some text");
}

struct Change {
    const char* name;
    void (*apply)(HkString&);
};
const Change changes[] = {
    {"assign", [](HkString& text) { text = "other"; }},
    {"assign string", [](HkString& text) { text = HkString("other"); }},
    {"append char", [](HkString& text) { text += '!'; }},
    {"append text", [](HkString& text) { text += "!!"; }},
    {"insert", [](HkString& text) { text.Insert(0, '0', 2); }},
    {"format", [](HkString& text) { text.Format("%d", 5); }},
    {"upper", [](HkString& text) { text.MakeUpper(); }},
    {"empty", [](HkString& text) { text.Empty(); }},
};

TEST(HkString, ChangingACopyNeverShowsInTheOther) {
    for (const std::size_t length : telling) {
        for (const Change& change : changes) {
            SCOPED_TRACE(change.name);
            const HkString original(sample(length).c_str());
            HkString copy(original);
            const HkString third(copy);
            change.apply(copy);
            expectIs(original, sample(length));
            expectIs(third, sample(length));
        }
    }
}

TEST(HkString, TakesItsOwnTextAsArgument) {
    for (const std::size_t length : telling) {
        const std::string text = sample(length);
        const std::string tail = text.substr(std::min<std::size_t>(3, length));
        const auto made = [&] { return HkString(text.c_str()); };
        HkString assigned = made();
        assigned = assigned.c_str() + (length - tail.size());
        expectIs(assigned, tail);
        HkString itself = made();
        itself = *&itself;
        expectIs(itself, text);
        HkString twice = made();
        twice.Append(twice, HkString::npos);
        twice += twice;
        expectIs(twice, text + text + text + text);
        HkString tailed = made();
        tailed += tailed.c_str() + (length - tail.size());
        expectIs(tailed, text + tail);
        HkString formatted = made();
        formatted.Format("<%s|%s>", formatted.c_str(), formatted.c_str());
        expectIs(formatted, "<" + text + "|" + text + ">");
    }
}

TEST(HkString, BehavesAsStandardTextUnderRandomChanges) {
    std::mt19937 random(20);
    const auto below = [&random](std::size_t limit) { return random() % limit; };
    std::vector<std::pair<HkString, std::string>> texts(4);
    for (int step = 0; step < 20000; ++step) {
        auto& [text, model] = texts[below(texts.size())];
        const auto& [otherText, otherModel] = texts[below(texts.size())];
        const std::size_t place = below(model.size() + 2);
        switch (model.size() < 5000 ? below(8) : 7) {
            case 0:
                text += static_cast<char>('A' + step % 26);
                model += static_cast<char>('A' + step % 26);
                break;
            case 1:
                text += otherText;
                model += std::string(otherModel);
                break;
            case 2:
                text.Append(sample(40).c_str(), static_cast<std::uint32_t>(place % 40));
                model += sample(place % 40);
                break;
            case 3:
                text.Insert(static_cast<std::uint32_t>(place), '0', static_cast<std::uint32_t>(step % 20));
                model.insert(std::min(place, model.size()), static_cast<std::size_t>(step % 20), '0');
                break;
            case 4:
                text = otherText;
                model = std::string(otherModel);
                break;
            case 5:
                text.MakeLower();
                std::transform(model.begin(), model.end(), model.begin(), &HkStr::ToLower);
                break;
            case 6:
                text = HkString(otherText);
                model = std::string(otherModel);
                break;
            default:
                text = text.c_str() + std::min(place, model.size());
                model.erase(0, std::min(place, model.size()));
        }
        expectIs(text, model);
    }
}

TEST(HkString, OrdersByUnsignedBytesAndThenByLength) {
    const std::vector<HkString> ascending = {"", "A", "AB", "B", "a", "ab", "\x7f", "\x80", "\xff"};
    for (std::size_t i = 0; i < ascending.size(); ++i) {
        for (std::size_t j = 0; j < ascending.size(); ++j) {
            EXPECT_EQ(ascending[i] < ascending[j], i < j) << i << " " << j;
            EXPECT_EQ(ascending[i] == ascending[j], i == j);
            EXPECT_EQ(ascending[i] != ascending[j].c_str(), i != j);
        }
    }
    EXPECT_EQ(HkString(), static_cast<const char*>(nullptr));
    EXPECT_NE(HkString(std::string_view("a\0b", 3)), "a");
}

TEST(HkString, FindsCharactersAndTexts) {
    const HkString text("0x1F 0X2f");
    EXPECT_EQ(text.GetIndexOfFirstChar('0', 0), 0U);
    EXPECT_EQ(text.GetIndexOfFirstChar('f', 'F'), 3U);
    EXPECT_EQ(text.GetIndexOfFirstChar('z', 0), 0xFFFFFFFFU);
    EXPECT_EQ(text.GetIndexOfFirstChar('z', 0), HkString::npos);
    EXPECT_EQ(text.GetIndexOfString("0x", HkString::CompareExact), 0U);
    EXPECT_EQ(text.GetIndexOfString("0X", HkString::CompareExact), 5U);
    EXPECT_EQ(text.GetIndexOfString("x2F", HkString::CompareIgnoreCase), 6U);
    EXPECT_EQ(text.GetIndexOfString("x2F", HkString::CompareExact), HkString::npos);
    EXPECT_EQ(text.GetIndexOfString("0X2f and more", HkString::CompareIgnoreCase), HkString::npos);
    EXPECT_EQ(text.GetIndexOfString(nullptr, HkString::CompareExact), 0U);
    EXPECT_EQ(HkString().GetIndexOfString("", HkString::CompareIgnoreCase), 0U);
}

TEST(HkString, CasesOfAsciiLettersOnly) {
    HkString text("aZ09-\xe4\xc4[`{@");
    text.MakeUpper();
    expectIs(text, "AZ09-\xe4\xc4[`{@");
    text.MakeLower();
    expectIs(text, "az09-\xe4\xc4[`{@");
}

TEST(HkString, RefusesWhatTheLengthWordCannotTell) {
    for (const std::size_t length : {std::size_t{0}, std::size_t{8}, std::size_t{100}}) {
        HkString text(sample(length).c_str());
        EXPECT_THROW(text.Insert(0, 'x', 0xFFFFFFFFU), std::length_error);
        EXPECT_THROW(HkString(std::string_view(text.c_str(), 0xFFFFFFFFU)), std::length_error);
        expectIs(text, sample(length));
    }
}

TEST(HkString, SeparateObjectsServeSeparateThreads) {
    const HkString shortText("zq73");
    const HkString longText(sample(500).c_str());
    std::vector<HkString> results(4);
    std::vector<std::thread> threads;
    for (HkString& result : results) {
        threads.emplace_back([&] {
            thread_local HkString last;  // ends behind the thread's store of small blocks
            for (int i = 0; i < 2000; ++i) {
                HkString changed(longText);
                changed += shortText;
                last = longText;
                result = changed;
            }
            last = shortText;
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    for (const HkString& result : results) {
        expectIs(result, sample(500) + "zq73");
    }
}

// Built before main and gone behind it; the strings in it come and go at those times, too.
struct EarlyAndLate {
    std::map<HkString, HkString> texts{{"short", HkString(sample(200).c_str())}, {"other", "value"}};
    ~EarlyAndLate() {
        HkString made("made after main");
        made += texts["short"];
        texts.clear();
    }
};
EarlyAndLate earlyAndLate;

TEST(HkString, WorksBeforeMainAndBehindIt) {
    expectIs(earlyAndLate.texts["short"], sample(200));
}

}  // namespace
