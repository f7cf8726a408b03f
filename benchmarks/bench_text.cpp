// The text class beside std::string, on short texts, which std::string holds in itself, and on long ones. The goal is
// to be no slower.
#include <functional>
#include <string>

#include "Item.h"

#include "HkString.h"

namespace {

constexpr const char* shortText = "zq73x144";
constexpr std::size_t longLength = 200;

std::string longText() {
    return std::string(longLength, 'a') + "tail";
}

template <class Text>
void construct(benchmark::State& state, const std::string& content) {
    if (std::string(Text(content.c_str()).c_str()) != content) {
        state.SkipWithError("not the text given");
    }
    const char* source = content.c_str();
    for (auto _ : state) {
        benchmark::DoNotOptimize(source);
        Text text(source);
        benchmark::DoNotOptimize(text);
    }
}

template <class Text>
void copy(benchmark::State& state, const std::string& content) {
    Text source(content.c_str());
    if (Text(source) != content.c_str()) {
        state.SkipWithError("not the text given");
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(source);
        Text text(source);
        benchmark::DoNotOptimize(text);
    }
}

template <class Text, class Compare>
void compare(benchmark::State& state, const std::string& content) {
    Text a(content.c_str());
    Text b(content.c_str());
    if (!(a == b) || a < b) {
        state.SkipWithError("equal texts compare as different");
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(a);
        benchmark::DoNotOptimize(b);
        const bool result = Compare()(a, b);
        benchmark::DoNotOptimize(result);
    }
}

/// One text of many pieces; what counts is a piece.
template <class Text, class Piece>
void append(benchmark::State& state, Piece piece, std::size_t pieceLength) {
    constexpr std::size_t pieces = 200;
    std::size_t length = 0;
    for (auto _ : state) {
        Text text;
        for (std::size_t i = 0; i < pieces; ++i) {
            benchmark::DoNotOptimize(piece);
            text += piece;
        }
        benchmark::DoNotOptimize(text);
        length = std::string(text.c_str()).size();
    }
    if (length != pieces * pieceLength) {
        state.SkipWithError("pieces are missing");
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(pieces));
}

template <class Text>
void constructShort(benchmark::State& state) {
    construct<Text>(state, shortText);
}
template <class Text>
void constructLong(benchmark::State& state) {
    construct<Text>(state, longText());
}
template <class Text>
void copyShort(benchmark::State& state) {
    copy<Text>(state, shortText);
}
template <class Text>
void copyLong(benchmark::State& state) {
    copy<Text>(state, longText());
}
template <class Text>
void compareShort(benchmark::State& state) {
    compare<Text, std::equal_to<Text>>(state, shortText);
}
template <class Text>
void compareLong(benchmark::State& state) {
    compare<Text, std::equal_to<Text>>(state, longText());
}
template <class Text>
void orderShort(benchmark::State& state) {
    compare<Text, std::less<Text>>(state, shortText);
}
template <class Text>
void appendChar(benchmark::State& state) {
    append<Text>(state, 'x', 1);
}
template <class Text>
void appendText(benchmark::State& state) {
    append<Text>(state, shortText, std::char_traits<char>::length(shortText));
}

template <BenchmarkBody Ours, BenchmarkBody Standard>
Item textItem(const char* name) {
    return {name, {"HkString", Ours}, {{"std::string", Standard}}, {}, 1.0, 0};
}

const RegisterItem items[] = {
    RegisterItem{textItem<constructShort<HkString>, constructShort<std::string>>("text_construct_short")},
    RegisterItem{textItem<constructLong<HkString>, constructLong<std::string>>("text_construct_long")},
    RegisterItem{textItem<copyShort<HkString>, copyShort<std::string>>("text_copy_short")},
    RegisterItem{textItem<copyLong<HkString>, copyLong<std::string>>("text_copy_long")},
    RegisterItem{textItem<compareShort<HkString>, compareShort<std::string>>("text_compare_short")},
    RegisterItem{textItem<compareLong<HkString>, compareLong<std::string>>("text_compare_long")},
    RegisterItem{textItem<orderShort<HkString>, orderShort<std::string>>("text_order_short")},
    RegisterItem{textItem<appendChar<HkString>, appendChar<std::string>>("text_append_char")},
    RegisterItem{textItem<appendText<HkString>, appendText<std::string>>("text_append_text")},
};

}  // namespace
