// Any bytes as a data file: keys and cells must be those of the plain model. The first byte chooses the separators.
#include <string>
#include <utility>

#include "deviceprofile/CellStore.h"
#include "fuzz/Fuzz.h"
#include "keyed/DataFileModel.h"

namespace {

constexpr std::pair<const char*, const char*> separators[] = {
    {":", ","}, {",", ""}, {"", ","}, {"::", "ab"}, {",", ","}};
constexpr int mostIndexes = 40;

void checkCells(CellStore& store, const std::string& key, const std::string& value, const char* rowSeparator,
                const char* fieldSeparator) {
    for (int row = -1; row < mostIndexes; ++row) {
        for (int field = -1; field < mostIndexes; ++field) {
            const char* const cell = store.cell(key.c_str(), rowSeparator, row, fieldSeparator, field);
            const auto expected = modelCell(value, rowSeparator, row, fieldSeparator, field);
            require((cell != nullptr) == expected.has_value() && (cell == nullptr || *expected == cell));
            if (!expected && field >= 0) {
                break;
            }
        }
    }
}

}  // namespace

void fuzz(Input input) {
    const auto& [rowSeparator, fieldSeparator] = separators[input.byte() % std::size(separators)];
    const std::string bytes(input.bytes());
    DeviceProfile::FileText text;
    text.name = "fuzz.acd";
    text.size = bytes.size();
    text.bytes.reset(new char[bytes.size() + 1]);
    bytes.copy(text.bytes.get(), bytes.size());
    CellStore store(std::move(text), "base", {true, true});
    const ModelSection section = modelSection(bytes, "base");
    require(store.cell("no such key\x01", "", 0, "", 0) == nullptr || section.count("no such key\x01") != 0);
    for (const auto& [key, value] : section) {
        checkCells(store, key, value, "", "");
        checkCells(store, key, value, rowSeparator, fieldSeparator);
    }
}
