// The slow, plain form of data files and cells, which the library's is compared with.
#pragma once

#include <algorithm>
#include <cstring>
#include <map>
#include <optional>
#include <string>
#include <vector>

using ModelSection = std::map<std::string, std::string>;

/// Null or the empty text for the separator leave the text whole.
inline std::vector<std::string> modelSplit(const std::string& text, const char* separator) {
    std::vector<std::string> pieces;
    std::size_t begin = 0;
    if (separator != nullptr && *separator != '\0') {
        for (std::size_t at = text.find(separator); at != std::string::npos; at = text.find(separator, begin)) {
            pieces.push_back(text.substr(begin, at - begin));
            begin = at + std::strlen(separator);
        }
    }
    pieces.push_back(text.substr(begin));
    return pieces;
}

inline std::string modelTrim(const std::string& text) {
    const std::size_t begin = text.find_first_not_of(" \t");
    return begin == std::string::npos ? "" : text.substr(begin, text.find_last_not_of(" \t") + 1 - begin);
}

inline std::vector<std::string> modelLines(const std::string& bytes) {
    const bool isMarked = bytes.compare(0, 3, "\xEF\xBB\xBF") == 0;
    std::vector<std::string> lines = modelSplit(bytes.substr(isMarked ? 3 : 0), "\n");
    for (std::string& line : lines) {
        line.erase(line.size() - (!line.empty() && line.back() == '\r' ? 1 : 0));
    }
    return lines;
}

/// The keys of one section of a data file.
inline ModelSection modelSection(const std::string& bytes, const std::string& wanted) {
    const std::vector<std::string> lines = modelLines(bytes);
    ModelSection result;
    std::optional<std::string> section;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        std::string line = lines[i].substr(std::min(lines[i].find_first_not_of(" \t"), lines[i].size()));
        const char first = line.empty() ? '#' : line[0];
        const std::size_t equals = first == '[' ? std::string::npos : line.find('=');
        if (first == '#' || first == ';') {
            continue;
        }
        for (bool open = equals != std::string::npos && line.back() == '\\'; open;) {
            line.pop_back();
            const std::string next = ++i < lines.size() ? lines[i] : "";
            open = !next.empty() && next.back() == '\\';
            line += next.substr(std::min(next.find_first_not_of(" \t"), next.size()));
        }
        line = modelTrim(line);
        if (line.find('\0') != std::string::npos) {
            continue;
        }
        if (first == '[') {
            const std::string name = line.back() == ']' ? modelTrim(line.substr(1, line.size() - 2)) : "";
            section = !name.empty() && name.find_first_of("[]") == std::string::npos ? name : section;
        } else if (equals != std::string::npos && section == wanted && !modelTrim(line.substr(0, equals)).empty()) {
            result[modelTrim(line.substr(0, equals))] = modelTrim(line.substr(equals + 1));
        }
    }
    return result;
}

/// The cell of a value; no indexes past 16 bits.
inline std::optional<std::string> modelCell(const std::string& value, const char* rowSeparator, int row,
                                            const char* fieldSeparator, int field) {
    const std::vector<std::string> rows = modelSplit(value, rowSeparator);
    if (row < 0 || static_cast<std::size_t>(row) >= rows.size()) {
        return std::nullopt;
    }
    const std::vector<std::string> fields = modelSplit(rows[static_cast<std::size_t>(row)], fieldSeparator);
    if (field < 0 || static_cast<std::size_t>(field) >= fields.size()) {
        return std::nullopt;
    }
    return fields[static_cast<std::size_t>(field)];
}
