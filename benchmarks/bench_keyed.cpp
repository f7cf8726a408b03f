// Keyed data files: opening a table of 10 000 rows and walking it by counting up.

#include <ProfileConfig.h>
#include <ProfileKeyTable.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "Item.h"

#if defined(TESSAL_HAS_INIH) && __has_include(<ini.h>)
#include <ini.h>
#define KEYED_HAS_INIH 1
#endif

namespace {

namespace fs = std::filesystem;

constexpr const char* key = "COMMAND_FORMAT";
constexpr int fieldsWalked = 2;

/// A data file whose one key has this many rows, a line each; removed at the end.
class RowsFile {
public:
    explicit RowsFile(int rows)
        : m_path(fs::temp_directory_path() / ("tessal_bench_" + std::to_string(std::rand()) + ".acd")) {
        std::ofstream file(m_path, std::ios::binary);
        file << "[base]\n" << key << " = \\\n";
        for (int row = 0; row < rows; ++row) {
            file << "    command" << row << ",TRUE,-p|-position" << (row + 1 < rows ? ":\\\n" : "\n");
        }
    }
    ~RowsFile() {
        std::error_code error;
        fs::remove(m_path, error);
    }
    RowsFile(const RowsFile&) = delete;
    RowsFile& operator=(const RowsFile&) = delete;

    std::string path() const { return m_path.u8string(); }

private:
    fs::path m_path;
};

const RowsFile& rowsFile(int rows) {
    static const RowsFile small(10000);
    static const RowsFile large(20000);
    return rows == 10000 ? small : large;
}

std::unique_ptr<ProfileKeyTable> openTable(int rows) {
    DeviceProfile::ProfileConfig base("base", 1, ProfilePartBound);
    return std::make_unique<ProfileKeyTable>(rowsFile(rows).path().c_str(), &base, static_cast<unsigned char>(1),
                                             static_cast<unsigned char>(1), static_cast<unsigned char>(1));
}

/// Walks the first two fields of all rows; gives the sum of their lengths.
std::size_t walk(ProfileKeyTable& table) {
    std::size_t sum = 0;
    for (short row = 0;; ++row) {
        for (short field = 0; field < fieldsWalked; ++field) {
            const char* const cell = table.getstringbykey(key, ":", row, ",", field);
            if (cell == nullptr) {
                return sum;
            }
            sum += std::strlen(cell);
        }
    }
}

using Rows = std::vector<std::vector<std::string>>;
using TableMap = std::map<std::string, Rows>;

std::vector<std::string> splitText(const std::string& text, char separator) {
    std::vector<std::string> pieces(1);
    for (const char ch : text) {
        if (ch == separator) {
            pieces.emplace_back();
        } else {
            pieces.back() += ch;
        }
    }
    return pieces;
}

TableMap tableMap(const std::string& value) {
    TableMap map;
    for (const std::string& row : splitText(value, ':')) {
        map[key].push_back(splitText(row, ','));
    }
    return map;
}

std::size_t walk(const TableMap& map) {
    const Rows& rows = map.find(key)->second;
    std::size_t sum = 0;
    for (const std::vector<std::string>& row : rows) {
        for (std::size_t field = 0; field < fieldsWalked; ++field) {
            sum += std::strlen(row[field].c_str());
        }
    }
    return sum;
}

/// Reads the value once and sums the lengths of the first two fields of each row.
std::size_t scan(const std::string& value) {
    std::size_t sum = 0;
    for (const char* row = value.c_str(); row != nullptr;) {
        const char* const first = std::strchr(row, ',');
        const char* const second = std::strchr(first + 1, ',');
        sum += static_cast<std::size_t>(second - row) - 1;
        const char* const end = std::strchr(second, ':');
        row = end != nullptr ? end + 1 : nullptr;
    }
    return sum;
}

std::string wholeValue(int rows) {
    return openTable(rows)->getstringbykey(key, nullptr, 0, nullptr, 0);
}

[[noreturn]] void stop(const char* what) {
    std::fprintf(stderr, "bench_keyed: the sides of %s do not agree\n", what);
    std::exit(1);
}

void walkOurs(benchmark::State& state) {
    const auto table = openTable(10000);
    if (walk(*table) != walk(tableMap(wholeValue(10000))) || walk(*table) != scan(wholeValue(10000))) {
        stop("table_walk_10000");
    }
    for ([[maybe_unused]] auto _ : state) {
        benchmark::DoNotOptimize(walk(*table));
    }
}

void walkMap(benchmark::State& state) {
    TableMap map = tableMap(wholeValue(10000));
    for ([[maybe_unused]] auto _ : state) {
        benchmark::DoNotOptimize(map);
        benchmark::DoNotOptimize(walk(map));
    }
}

void walkScan(benchmark::State& state) {
    std::string value = wholeValue(10000);
    for ([[maybe_unused]] auto _ : state) {
        benchmark::DoNotOptimize(value);
        benchmark::DoNotOptimize(scan(value));
    }
}

void openAndWalk(benchmark::State& state, int rows) {
    for ([[maybe_unused]] auto _ : state) {
        benchmark::DoNotOptimize(walk(*openTable(rows)));
    }
}

void openAndWalk10000(benchmark::State& state) {
    openAndWalk(state, 10000);
}

void openAndWalk20000(benchmark::State& state) {
    openAndWalk(state, 20000);
}

void openOurs(benchmark::State& state) {
    rowsFile(10000);
    for ([[maybe_unused]] auto _ : state) {
        benchmark::DoNotOptimize(openTable(10000));
    }
}

void openLimit(benchmark::State& state) {
    const std::string path = rowsFile(10000).path();
    for ([[maybe_unused]] auto _ : state) {
        const auto size = static_cast<std::size_t>(fs::file_size(path));
        const std::unique_ptr<char[]> bytes(new char[size]);
        std::ifstream file(path, std::ios::binary);
        file.read(bytes.get(), static_cast<std::streamsize>(size));
        benchmark::DoNotOptimize(bytes.get());
    }
}

#ifdef KEYED_HAS_INIH
/// Keeps the rows of each key apart; the fields stay unsplit.
using InihTable = std::map<std::string, std::vector<std::string>>;

int addRow(void* user, const char*, const char* name, const char* value) {
    (*static_cast<InihTable*>(user))[name].emplace_back(value);
    return 1;
}

void openInih(benchmark::State& state) {
    const std::string path = rowsFile(10000).path();
    for ([[maybe_unused]] auto _ : state) {
        InihTable values;
        ini_parse(path.c_str(), &addRow, &values);
        benchmark::DoNotOptimize(values);
    }
}
const std::vector<Side> openPeers{{"inih", openInih}};
#else
const std::vector<Side> openPeers;
#endif

const RegisterItem tableWalk{{"table_walk_10000",
                              {"ProfileKeyTable", walkOurs},
                              {{"map of vectors", walkMap}},
                              {"one scan of the value", walkScan},
                              2.50,
                              3.00}};
const RegisterItem tableGrowth{{"table_growth_20000",
                                {"open and walk 20 000", openAndWalk20000},
                                {{"ours, 10 000 rows", openAndWalk10000}},
                                {},
                                2.30,
                                0}};
const RegisterItem tableOpen{
    {"table_open_10000", {"ProfileKeyTable", openOurs}, openPeers, {"read the file", openLimit}, 0.10, 14.00}};

}  // namespace
