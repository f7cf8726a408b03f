// Any bytes as a data file: keys and cells must be those of the plain model. The first byte chooses the separators.

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "HkMessageManager.h"
#include "deviceprofile/CellStore.h"
#include "keyed/DataFileModel.h"

namespace {

struct Separators {
    const char* row;
    const char* field;
};
constexpr Separators separators[] = {{":", ","}, {",", ""}, {"", ","}, {"", ""}, {"::", "ab"}, {",", ","}};
constexpr int mostIndexes = 40;

DeviceProfile::FileText fileText(const std::string& bytes) {
    DeviceProfile::FileText text;
    text.name = "fuzz.acd";
    text.size = bytes.size();
    text.bytes.reset(new char[bytes.size() + 1]);
    bytes.copy(text.bytes.get(), bytes.size());
    return text;
}

void checkCells(CellStore& store, const std::string& key, const std::string& value, const Separators& split) {
    for (int row = -1; row < mostIndexes; ++row) {
        for (int field = -1; field < mostIndexes; ++field) {
            const char* const cell = store.cell(key.c_str(), split.row, row, split.field, field);
            const auto expected = modelCell(value, split.row, row, split.field, field);
            if ((cell != nullptr) != expected.has_value() || (cell != nullptr && *expected != cell)) {
                std::abort();
            }
            if (!expected && field >= 0) {
                break;
            }
        }
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    if (size == 0) {
        return 0;
    }
    const Separators& split = separators[data[0] % std::size(separators)];
    const std::string bytes(data + 1, data + size);
    CellStore store(fileText(bytes), "base", {true, true});
    if (store.cell("no such key\x01", "", 0, "", 0) != nullptr &&
        modelSection(bytes, "base").count("no such key\x01") == 0) {
        std::abort();
    }
    for (const auto& [key, value] : modelSection(bytes, "base")) {
        checkCells(store, key, value, {"", ""});
        checkCells(store, key, value, split);
    }
    return 0;
}
