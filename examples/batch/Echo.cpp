#include "Echo.h"

#include <algorithm>
#include <array>
#include <vector>

#include "Quoting.h"

namespace {

constexpr std::size_t widestColumn = 36;

/// Name, values and meaning of one argument.
using Row = std::array<std::string, 3>;

std::string valuesOf(const HkCmdArgs& args, const char* name) {
    std::string text;
    for (const HkString& value : args.list(name)) {
        text += (text.empty() ? "" : " ") + quotedWhereNeeded(value.view());
    }
    return text;
}

std::string nameOf(const HkCmdArgInfo& info) {
    const std::string name(info.names.front());
    return info.kind == HkCmdArgInfo::Kind::Positional ? "<" + name + ">" : name;
}

/// Positions are the one value that does not stand as the user gave it.
std::string meaningOf(const HkCmdArgInfo& info) {
    const bool isPosition = info.names.front() == "-p";
    return std::string(info.help) + (isPosition ? ", counted from 0" : "");
}

std::vector<Row> rowsOf(const HkCmdArgs& args, const char* format) {
    std::vector<Row> rows;
    for (const HkCmdArgInfo& info : HkCmdArgs::describe(format)) {
        if (args.isGiven(info.names.front())) {
            rows.push_back({nameOf(info), valuesOf(args, info.names.front()), meaningOf(info)});
        }
    }
    return rows;
}

std::size_t widthOf(const std::vector<Row>& rows, std::size_t column) {
    std::size_t width = 0;
    for (const Row& row : rows) {
        width = std::max(width, row[column].size());
    }
    return std::min(width, widestColumn);
}

std::string padded(const std::string& text, std::size_t width) {
    return text + std::string(text.size() < width ? width - text.size() : 0, ' ') + "  ";
}

}  // namespace

std::string echoOf(const HkCmdArgs& args, const char* format) {
    HkString command(args.command());
    command.MakeLower();
    std::string text = std::string(command) + "\n";
    const std::vector<Row> rows = rowsOf(args, format);
    const std::size_t nameWidth = widthOf(rows, 0);
    const std::size_t valueWidth = widthOf(rows, 1);
    for (const Row& row : rows) {
        text += "        " + padded(row[0], nameWidth) + padded(row[1], valueWidth) + row[2] + "\n";
    }
    return text;
}
