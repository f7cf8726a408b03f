#include <algorithm>
#include <cstdio>
#include <exception>
#include <fstream>
#include <regex>

#include "Options.h"
#include "Registry.h"
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

bool writeCsv(const std::string& path, const std::vector<Row>& rows) {
    std::ofstream file(path);
    file << csv(rows);
    file.close();
    if (!file) {
        std::fprintf(stderr, "Cannot write %s.\n", path.c_str());
    }
    return static_cast<bool>(file);
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
    const auto failed = std::count_if(rows.begin(), rows.end(), [](const Row& row) { return !row.error.empty(); });
    const auto missed = std::count_if(rows.begin(), rows.end(), [](const Row& row) { return !row.isMet(); });
    std::printf("\n%zu items, %td with an error, %td with a missed goal\n", rows.size(), failed, missed);
    const bool isWritten = options.csvFile.empty() || writeCsv(options.csvFile, rows);
    return failed > 0 || !isWritten || (options.isStrict && missed > 0) ? 1 : 0;
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
