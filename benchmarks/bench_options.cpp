// Setting every option and reading every range, against the same settings kept by key in a map.

#include <map>
#include <string>
#include <vector>

#include "DeviceOptionsMgr.h"
#include "benchmarks/Item.h"

namespace {

constexpr int rowCount = 105;

tESSALNS::PROGRAM_OPTION row(int number) {
    return static_cast<tESSALNS::PROGRAM_OPTION>(number);
}

std::size_t readAll(const DeviceOptionsMgr& manager) {
    return manager.getProgramOptions().size() + manager.getEraseOptions().size() + manager.getReadbackOptions().size() +
           manager.getVerifyOptions().size() + manager.getCustCodeOptions().size();
}

void setAndReadOurs(benchmark::State& state) {
    DeviceOptionsMgr manager;
    for (auto _ : state) {
        manager.clearAllOptions();
        for (int i = 0; i < rowCount; ++i) {
            if (!manager.setOption(row(i), true)) {
                manager.setOption(row(i), "1A2B3C4D");
            }
        }
        benchmark::DoNotOptimize(readAll(manager));
    }
}

struct MapRow {
    std::string key;
    std::string dashValue;
    bool isSwitch;
};

std::vector<MapRow> mapRows() {
    std::vector<MapRow> rows;
    for (const tESSALNS::OptionRow& row : tESSALNS::programOptionRows) {
        rows.push_back({row.key, row.dashValue, row.isSwitch()});
    }
    return rows;
}

/// The ranges without their groups: less work than ours does.
void setAndReadMap(benchmark::State& state) {
    const std::vector<MapRow> rows = mapRows();
    std::map<std::string, std::string> values;
    for (auto _ : state) {
        values.clear();
        for (const MapRow& row : rows) {
            values[row.key] = row.isSwitch ? "1" : "1A2B3C4D";
        }
        std::vector<std::string> texts;
        for (const MapRow& row : rows) {
            const auto found = values.find(row.key);
            if (found != values.end()) {
                texts.push_back(row.dashValue);
                if (!row.isSwitch) {
                    texts.push_back(found->second);
                }
            }
        }
        benchmark::DoNotOptimize(texts.data());
    }
}

const RegisterItem optionsItem{
    {"options_set_read", {"DeviceOptionsMgr", setAndReadOurs}, {{"map of strings", setAndReadMap}}, {}, 0.5, 0}};

}  // namespace
