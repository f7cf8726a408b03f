#include "Picture.h"

#include <algorithm>
#include <cmath>

#include "Table.h"

namespace {

// The scale: powers of two from the least to the greatest exponent; a ratio beyond them is drawn at the end.
constexpr int leastExponent = -8;
constexpr int greatestExponent = 4;
constexpr double exponentWidth = 44;

constexpr double margin = 12;
constexpr double labelWidth = 210;
constexpr double headHeight = 92;
constexpr double rowHeight = 26;
constexpr double barHeight = 9;
constexpr double valuesWidth = 130;
constexpr double chartWidth = exponentWidth * (greatestExponent - leastExponent);

constexpr const char* peerColour = "#4c86b8";
constexpr const char* limitColour = "#e0a04f";
constexpr const char* missedColour = "#c0392b";

double placeOf(double ratio) {
    const double exponent = std::clamp<double>(std::log2(ratio), leastExponent, greatestExponent);
    return labelWidth + exponentWidth * (exponent - leastExponent);
}

std::string text(double x, double y, const std::string& words, const char* more = "") {
    return formatted("<text x=\"%.1f\" y=\"%.1f\"%s>", x, y, more) + escaped(words) + "</text>\n";
}

std::string line(double x1, double y1, double x2, double y2, const char* stroke, double width) {
    return formatted("<line x1=\"%.1f\" y1=\"%.1f\" x2=\"%.1f\" y2=\"%.1f\" stroke=\"%s\" stroke-width=\"%g\"/>\n", x1,
                     y1, x2, y2, stroke, width);
}

std::string box(double x, double y, double width, const char* fill) {
    return formatted("<rect x=\"%.1f\" y=\"%.1f\" width=\"%.1f\" height=\"%g\" fill=\"%s\"/>\n", x, y, width, barHeight,
                     fill);
}

std::string scale(double height) {
    std::string result;
    for (int exponent = leastExponent; exponent <= greatestExponent; ++exponent) {
        const double x = placeOf(std::exp2(exponent));
        result += line(x, headHeight - 6, x, height - margin, exponent == 0 ? "#333" : "#ddd", 1);
        result += text(x, headHeight - 12,
                       exponent < 0 ? "1/" + std::to_string(1 << -exponent) : std::to_string(1 << exponent),
                       " text-anchor=\"middle\"");
    }
    return result;
}

std::string legend() {
    const char* const bold = " font-weight=\"bold\"";
    double x = labelWidth;
    std::string result = text(margin, 26, "Time of ours / time of theirs", bold);
    result += text(x, 26, "left of 1: faster; right of 1: slower");
    const struct {
        const char* words;
        const char* colour;
    } marks[] = {{"fastest peer", peerColour}, {"limit of the machine", limitColour}, {"goal missed", missedColour}};
    for (const auto& mark : marks) {
        result += box(x, 41, 16, mark.colour) + text(x + 22, 50, mark.words);
        x += 165;
    }
    result += text(labelWidth + chartWidth + margin, headHeight - 12, "peer / limit");
    return result + line(x, 38, x, 53, "#111", 2) + text(x + 8, 50, "goal");
}

std::string bar(const Opponent& opponent, double y, const char* colour) {
    if (!opponent.isThere()) {
        return {};
    }
    const double parity = placeOf(1);
    const double end = placeOf(opponent.ratio);
    std::string result =
        box(std::min(parity, end), y, std::max(std::abs(end - parity), 1.0), opponent.isMet() ? colour : missedColour);
    if (opponent.goal > 0) {
        const double goal = placeOf(opponent.goal);
        result += line(goal, y - 1, goal, y + barHeight + 1, "#111", 2);
    }
    return result;
}

std::string ratioOf(const Opponent& opponent) {
    return opponent.isThere() ? formatted("%.2f", opponent.ratio) : "-";
}

std::string rowOf(const Row& row, double y) {
    const double values = labelWidth + chartWidth + margin;
    std::string result = text(labelWidth - 8, y + 15, row.item, " text-anchor=\"end\"");
    if (!row.error.empty()) {
        return result + text(values, y + 15, "error");
    }
    result += bar(row.peer, y + 3, peerColour) + bar(row.limit, y + 3 + barHeight + 1, limitColour);
    return result + text(values, y + 15, ratioOf(row.peer) + " / " + ratioOf(row.limit));
}

}  // namespace

std::string picture(const std::vector<Row>& rows) {
    const double width = labelWidth + chartWidth + valuesWidth;
    const double height = headHeight + rowHeight * static_cast<double>(rows.size()) + margin;
    std::string result =
        formatted("<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"%g\" height=\"%g\" ", width, height);
    result += "font-family=\"sans-serif\" font-size=\"12\" fill=\"#111\">\n<title>Benchmarks</title>\n";
    result += "<rect width=\"100%\" height=\"100%\" rx=\"6\" fill=\"white\"/>\n" + legend() + scale(height);
    double y = headHeight;
    for (const Row& row : rows) {
        result += rowOf(row, y);
        y += rowHeight;
    }
    return result + "</svg>\n";
}
