// The text class beside std::string, on short texts, which std::string holds in itself, and on long ones. The goal is
// to be no slower.
#include <functional>
#include <string>
#include <vector>

#include "Item.h"

#include "HkString.h"

namespace {

constexpr const char* shortText = "zq73x144";
constexpr std::size_t longLength = 200;

std::string longText() {
    return std::string(longLength, 'a') + "tail";
}

/// The content and seven that are longer by a character each: where the heap places one text decides its time by a
/// tenth, as a copy or a comparison across cache lines costs more.
std::vector<std::string> contentsFrom(std::string content) {
    std::vector<std::string> contents;
    for (int i = 0; i < 8; ++i) {
        contents.push_back(content);
        content += 'x';
    }
    return contents;
}

template <class Text>
std::vector<Text> textsOf(const std::vector<std::string>& contents) {
    std::vector<Text> texts;
    texts.reserve(contents.size());
    for (const std::string& content : contents) {
        texts.emplace_back(content.c_str());
    }
    return texts;
}

/// Makes a text of a source, round after round, and what counts is one.
template <class Text, class Source>
void make(benchmark::State& state, const std::vector<Source>& sources) {
    for (auto _ : state) {
        for (const Source& source : sources) {
            Text text(source);
            benchmark::DoNotOptimize(text);
        }
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(sources.size()));
}

template <class Text>
void construct(benchmark::State& state, const std::string& content) {
    const std::vector<std::string> contents = contentsFrom(content);
    std::vector<const char*> sources;
    sources.reserve(contents.size());
    for (const std::string& one : contents) {
        sources.push_back(one.c_str());
    }
    if (std::string(Text(sources[0]).c_str()) != content) {
        state.SkipWithError("not the text given");
    }
    make<Text>(state, sources);
}

template <class Text>
void copy(benchmark::State& state, const std::string& content) {
    const std::vector<Text> sources = textsOf<Text>(contentsFrom(content));
    if (Text(sources[0]) != content.c_str()) {
        state.SkipWithError("not the text given");
    }
    make<Text>(state, sources);
}

template <class Text, class Compare>
void compare(benchmark::State& state, const std::string& content) {
    const std::vector<Text> a = textsOf<Text>(contentsFrom(content));
    const std::vector<Text> b = textsOf<Text>(contentsFrom(content));
    if (!(a[0] == b[0]) || a[0] < b[0]) {
        state.SkipWithError("equal texts compare as different");
    }
    for (auto _ : state) {
        for (std::size_t i = 0; i < a.size(); ++i) {
            const bool result = Compare()(a[i], b[i]);
            benchmark::DoNotOptimize(result);
        }
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(a.size()));
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
