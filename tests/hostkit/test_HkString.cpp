#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <future>
#include <random>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "HkString.h"

namespace {

/// The text reads so, by the object's one pointer and the length word before its text, too.
void expectIs(const HkString& text, const std::string& expected) {
    static_assert(sizeof(HkString) == sizeof(char*));
    const char* pointer = nullptr;
    std::uint32_t length = 0;
    std::memcpy(&pointer, &text, sizeof pointer);
    std::memcpy(&length, pointer - 4, sizeof length);
    ASSERT_EQ(text.view(), expected);
    EXPECT_EQ(length, expected.size());
    EXPECT_EQ(pointer[expected.size()], '\0');
}

std::string sample(std::size_t length) {
    std::string text;
    while (text.size() < length) {
        text += "abcdefghijklmnopqrstuvwxyz-09AMZ@[`{\xe4\xc4";
    }
    return text.substr(0, length);
}

TEST(HkString, MayHoldAnyByteAndIsNeverNull) {
    for (const std::string& text : {std::string("a\0b", 3), std::string(1U << 20, '\0') + "b"}) {
        expectIs(HkString(std::string_view(text)), text);
    }
    HkString assigned("some text");
    assigned = nullptr;
    HkString moved("some text");
    expectIs(HkString(std::move(moved)), "some text");
    for (const HkString& text : {HkString(), HkString(nullptr), HkString(""), assigned, moved}) {
        expectIs(text, "");
    }
}

constexpr std::uint32_t emptying = 9;
constexpr std::uint32_t changeCount = 11;

/// Makes one change to the text and gives what it must read then. The other may be the same string, or share its text.
std::string change(HkString& text, const HkString& other, std::uint32_t kind, std::uint32_t number) {
    std::string model(text.view());
    const std::string otherModel(other.view());
    const std::size_t place = number % (model.size() + 1);
    const auto count = static_cast<std::uint32_t>(std::min<std::size_t>(model.size() - place, number % 40));
    switch (kind) {
        case 0:
            text += static_cast<char>('A' + number % 26);
            return model + static_cast<char>('A' + number % 26);
        case 1:
            text += other;
            return model + otherModel;
        case 2:
            text.Append(text.c_str() + place, count);
            return model + model.substr(place, count);
        case 3:
            text.Insert(number % (text.Length() + 2), '0', number % 20);
            return model.insert(std::min<std::size_t>(number % (model.size() + 2), model.size()), number % 20, '0');
        case 4:
            text = other;
            return otherModel;
        case 5:
            number % 2 == 0 ? text.MakeLower() : text.MakeUpper();
            std::transform(model.begin(), model.end(), model.begin(),
                           number % 2 == 0 ? &HkStr::ToLower : &HkStr::ToUpper);
            return model;
        case 6:
            text = HkString(sample(number % 70).c_str());
            return sample(number % 70);
        case 7:
            text.Format("<%s|%s>", text.c_str(), other.c_str());
            return "<" + model + "|" + otherModel + ">";
        case 8:
            text += text.c_str() + place;
            return model + model.substr(place);
        case emptying:
            text.Empty();
            return "";
        default:
            text = text.c_str() + place;
            return model.substr(place);
    }
}

// Texts short, long, shared and alone, changed by their own text as well as by another's: a copy never shows a change.
TEST(HkString, BehavesAsStandardTextUnderRandomChanges) {
    std::mt19937 random(20);
    std::vector<HkString> texts(4);
    std::vector<std::string> models(4);
    for (int step = 0; step < 40000; ++step) {
        const std::size_t one = random() % texts.size();
        const std::size_t other = random() % texts.size();
        const auto kind = static_cast<std::uint32_t>(models[one].size() < 5000 ? random() % changeCount : emptying);
        models[one] = change(texts[one], texts[other], kind, static_cast<std::uint32_t>(random() % 10000));
        for (std::size_t i = 0; i < texts.size(); ++i) {
            SCOPED_TRACE(testing::Message() << "step " << step << ", change " << kind << ", text " << i);
            expectIs(texts[i], models[i]);
            ASSERT_FALSE(testing::Test::HasFailure());
        }
    }
}

TEST(HkString, ComparesAsStandardText) {
    std::vector<std::string> texts = {"", "A", "AB", "B", "a", "\x7f", "\x80", "\xff", {"a\0b", 3}};
    for (std::size_t length = 1; length <= 24; ++length) {
        for (std::size_t place = 0; place < length; ++place) {
            texts.push_back(sample(length));
            texts.back()[place] = '#';
        }
    }
    for (const std::string_view one : texts) {
        for (const std::string& other : texts) {
            ASSERT_EQ(HkString(one) == HkString(std::string_view(other)), one == other) << one << " " << other;
            ASSERT_EQ(HkString(one) < HkString(std::string_view(other)), one < other) << one << " " << other;
            ASSERT_EQ(HkString(one) != other.c_str(), one != other.c_str()) << one << " " << other;
        }
    }
    EXPECT_EQ(HkString(), static_cast<const char*>(nullptr));
}

TEST(HkString, FindsCharactersAndTexts) {
    const HkString text("0x1F 0X2f");
    EXPECT_EQ(text.GetIndexOfFirstChar('0', 0), 0U);
    EXPECT_EQ(text.GetIndexOfFirstChar('f', 'F'), 3U);
    EXPECT_EQ(text.GetIndexOfFirstChar('z', 0), HkString::npos);
    EXPECT_EQ(text.GetIndexOfString("0x", HkString::CompareExact), 0U);
    EXPECT_EQ(text.GetIndexOfString("0X", HkString::CompareExact), 5U);
    EXPECT_EQ(text.GetIndexOfString("x2F", HkString::CompareIgnoreCase), 6U);
    EXPECT_EQ(text.GetIndexOfString("0X2f and more", HkString::CompareIgnoreCase), HkString::npos);
    EXPECT_EQ(text.GetIndexOfString(nullptr, HkString::CompareExact), 0U);
    EXPECT_EQ(HkString().GetIndexOfString("", HkString::CompareIgnoreCase), 0U);
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
    const auto work = [&] {
        thread_local HkString last;  // ends behind the thread's store of small blocks
        for (int i = 0; i < 2000; ++i) {
            last = longText;
            last += shortText;
        }
        const HkString result = last;
        last = shortText;
        return result;
    };
    std::vector<std::future<HkString>> results(4);
    std::generate(results.begin(), results.end(), [&] { return std::async(std::launch::async, work); });
    for (std::future<HkString>& result : results) {
        expectIs(result.get(), sample(500) + "zq73");
    }
}

// Built before main and gone behind it; the strings in it come and go at those times, too.
struct EarlyAndLate {
    HkString shortText{"early"};
    HkString longText{sample(200).c_str()};
    ~EarlyAndLate() {
        HkString made("made after main");
        made += longText;
        shortText = made;
    }
};
EarlyAndLate earlyAndLate;

TEST(HkString, WorksBeforeMainAndBehindIt) {
    expectIs(earlyAndLate.longText, sample(200));
}

}  // namespace
