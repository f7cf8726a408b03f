#include "TessalCmdargs.h"

#include <limits>
#include <memory>

#include "AcdReader.h"
#include "HkStr.h"
#include "ProfileKeyTable.h"
#include "TessalException.h"
#include "UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/TessalCmdargs", "$Revision: 1.1 $"};

std::string_view viewOf(const char* text) {
    return text != nullptr ? text : "";
}

const char* cell(ProfileKeyTable& table, int row, short field) {
    return table.getstringbykey("COMMAND_FORMAT", ":", static_cast<short>(row), ",", field);
}

}  // namespace

std::map<HkString, TessalCmdargs::CommandFormat, ltptstr> TessalCmdargs::m_tessalBatchCommands;

void TessalCmdargs::createCommandMap() {
    const AcdReader reader;
    ProfileKeyTable& table = *reader.getDevkey();
    for (int row = 0; row <= std::numeric_limits<short>::max(); ++row) {
        const char* const name = cell(table, row, 0);
        if (name == nullptr) {
            return;
        }
        const bool isBatch = HkStr::ICompare(cell(table, row, 1), "TRUE") == 0;
        const char* const format = cell(table, row, 2);
        if (format == nullptr) {
            origin.raise<DataMismatchException>();
        }
        m_tessalBatchCommands[name] = CommandFormat{format, isBatch};
    }
}

const char* TessalCmdargs::findFormatString(const char* command) {
    const auto place = m_tessalBatchCommands.find(viewOf(command));
    return place != m_tessalBatchCommands.end() ? place->second.formatString.c_str() : "";
}

const char* TessalCmdargs::findBatchFormatString(const char* command) {
    const auto place = m_tessalBatchCommands.find(viewOf(command));
    return place != m_tessalBatchCommands.end() && place->second.isBatch ? place->second.formatString.c_str() : "";
}

HkCmdArgs* TessalCmdargs::getCmdargs(int argc, char* const* argv, bool strict) {
    if (m_tessalBatchCommands.empty()) {
        createCommandMap();
    }
    HkString name(argc > 0 && argv != nullptr ? argv[0] : nullptr);
    name.MakeLower();
    const char* const format = findFormatString(name);
    if (format[0] == '\0') {
        origin.raise<ACDEntryNotFoundException>();
    }
    auto parser = std::make_unique<HkCmdArgs>(argc, argv, format, nullptr, static_cast<unsigned short>(0));
    if (strict && parser->iserror() != 0) {
        origin.raise<InvalidArgumentException>();
    }
    return parser.release();
}

std::vector<HkString> TessalCmdargs::findMatchingCommands(const char* prefix) {
    std::vector<HkString> names;
    const std::size_t length = HkStr::Len(prefix);
    for (const auto& [name, format] : m_tessalBatchCommands) {
        if (format.isBatch && HkStr::INCompare(name, prefix, length) == 0) {
            names.push_back(name);
        }
    }
    return names;
}

std::vector<HkString> TessalCmdargs::findAllCommands() {
    return findMatchingCommands("");
}
