#include <algorithm>
#include <cstdio>
#include <exception>
#include <filesystem>
#include <fstream>
#include <regex>

#include "Options.h"
#include "Picture.h"
#include "Registry.h"
#include "Report.h"
#include "Table.h"

namespace {

std::vector<Item> chosenItems(const std::string& filter) {
    const std::regex pattern(filter);
    std::vector<Item> result;
    for (const Item& item : registeredItems()) {
        if (std::regex_search(item.name, pattern)) {
            result.push_back(item);
        }
    }
    return result;
}

std::size_t widestName(const std::vector<Item>& items) {
    std::size_t width = 0;
    for (const Item& item : items) {
        width = std::max(width, std::string(item.name).size());
    }
    return width;
}

// Each row is shown as soon as it is there.
std::vector<Row> runAndShow(const std::vector<Item>& items, const RoundSettings& settings) {
    const std::size_t width = widestName(items);
    std::printf("%s; %d rounds\n\n%s", describeMachine().c_str(), settings.rounds, textHeading(width).c_str());
    std::vector<Row> rows;
    for (const Item& item : items) {
        rows.push_back(runItem(item, settings));
        std::fputs(textRow(rows.back(), width).c_str(), stdout);
        std::fflush(stdout);
    }
    return rows;
}

bool writeFile(const std::filesystem::path& path, const std::string& text) {
    std::ofstream file(path, std::ios::binary);
    file << text;
    file.close();
    if (!file) {
        std::fprintf(stderr, "Cannot write %s.\n", path.string().c_str());
    }
    return static_cast<bool>(file);
}

bool writeFiles(const Options& options, const std::vector<Row>& rows) {
    const std::filesystem::path folder(options.reportFolder);
    return (options.csvFile.empty() || writeFile(options.csvFile, csv(rows))) &&
           (folder.empty() || (writeFile(folder / "benchmarks.md", page(rows, options.rounds)) &&
                               writeFile(folder / "pictures" / "benchmarks.svg", picture(rows))));
}

int run(const Options& options) {
    const std::vector<Item> items = chosenItems(options.filter);
    if (options.isList) {
        for (const Item& item : items) {
            std::puts(item.name);
        }
        return 0;
    }
    if (items.empty()) {
        std::fprintf(stderr, "No item's name matches %s.\n", options.filter.c_str());
        return 2;
    }
    const std::vector<Row> rows = runAndShow(items, options.rounds);
    std::printf("\n%s\n", summary(rows).c_str());
    const bool isWritten = writeFiles(options, rows);
    const bool hasFailed = std::any_of(rows.begin(), rows.end(), [](const Row& row) { return !row.error.empty(); });
    const bool isMet = std::all_of(rows.begin(), rows.end(), [](const Row& row) { return row.isMet(); });
    return hasFailed || !isWritten || (options.isStrict && !isMet) ? 1 : 0;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        const Options options = readOptions(argc, argv);
        if (options.isHelp) {
            std::fputs(usage, stdout);
            return 0;
        }
        return run(options);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "Not understood: %s\n\n%s", error.what(), usage);
        return 2;
    }
}
