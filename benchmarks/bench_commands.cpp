// A command's words into a checked command: the look-up of its format, then the walk over the arguments.

#include <getopt.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "DataPath.h"
#include "HkCmdArgs.h"
#include "TessalCmdargs.h"
#include "benchmarks/Item.h"

#if __has_include(<CLI/CLI.hpp>)
#include <CLI/CLI.hpp>
#endif

namespace {

const char* const programFormat =
    "-p|-position <device=int>... [-e|-erase] [-v|-verify] [-u|-usercode <code=hex>] [-file <image=file>]";

/// Eight more commands stand in the table, so that the look-up is one.
const std::map<std::string, std::string>& formats() {
    static const std::map<std::string, std::string> table = {
        {"program", programFormat},
        {"erase", "-p <device=int>..."},
        {"verify", "-p <device=int>... <file>"},
        {"identify", "[-all]"},
        {"setmode", "<mode>"},
        {"setcable", "-port <port> [-baud <int>]"},
        {"checksum", "-p <device=int>"},
        {"readback", "-p <int> -f <file>"},
        {"quit", ""},
    };
    return table;
}

/// The words of the command; the two getopt and CLI11 sides need long names to have two dashes.
std::vector<const char*> words(bool doubleDash) {
    return {"program",  "-p",
            "1",        "2",
            "3",        doubleDash ? "--erase" : "-erase",
            "-v",       "-u",
            "1A2B3C4D", doubleDash ? "--file" : "-file",
            "image.mcs"};
}

struct Checked {
    std::vector<long long> positions;
    bool erase = false;
    bool verify = false;
    unsigned long long usercode = 0;
    std::string file;

    bool operator==(const Checked& other) const {
        return positions == other.positions && erase == other.erase && verify == other.verify &&
               usercode == other.usercode && file == other.file;
    }
};

// Ours.

/// Fills the table of commands from a data file with the rows of formats().
void loadCommands() {
    const std::filesystem::path directory = std::filesystem::temp_directory_path() / "tessal_bench_commands";
    std::filesystem::create_directories(directory);
    std::string rows;
    for (const auto& [name, format] : formats()) {
        rows.append(rows.empty() ? "" : ":").append(name).append(",TRUE,").append(format);
    }
    std::ofstream(directory / "tessal.acd") << "[base]\nCOMMAND_FORMAT = " << rows << "\n";
    DeviceProfile::setDataPath(directory.string().c_str());
    TessalCmdargs::createCommandMap();
    DeviceProfile::setDataPath(nullptr);
    std::filesystem::remove_all(directory);
}

std::unique_ptr<HkCmdArgs> parseByOurs(CommandSet& command) {
    return std::unique_ptr<HkCmdArgs>(
        TessalCmdargs::getCmdargs(command.getNumberCommands(), command.getCommands(), true));
}

CommandSet commandSet() {
    CommandSet command;
    for (const char* const word : words(false)) {
        command.addCommand(word);
    }
    return command;
}

Checked readByOurs() {
    CommandSet command = commandSet();
    const std::unique_ptr<HkCmdArgs> args = parseByOurs(command);
    Checked checked;
    for (int i = 0; i < args->valueCount("-p"); ++i) {
        checked.positions.push_back(args->integer("-p", i));
    }
    checked.erase = args->isGiven("-e");
    checked.verify = args->isGiven("-v");
    checked.usercode = args->hex("-u");
    checked.file = args->text("-file");
    return checked;
}

void requireAgreement();

void ours(benchmark::State& state) {
    requireAgreement();
    CommandSet command = commandSet();
    for (auto step : state) {
        benchmark::DoNotOptimize(command.getCommands());
        const std::unique_ptr<HkCmdArgs> args = parseByOurs(command);
        unsigned char error = args->iserror();
        benchmark::DoNotOptimize(error);
    }
}

// Limit: the C library's walk, which hands out the switches and leaves the values as they are.

Checked parseByGetopt(char* const* command, int count) {
    static const option longOptions[] = {
        {"position", required_argument, nullptr, 'p'}, {"erase", no_argument, nullptr, 'e'},
        {"verify", no_argument, nullptr, 'v'},         {"usercode", required_argument, nullptr, 'u'},
        {"file", required_argument, nullptr, 'f'},     {nullptr, 0, nullptr, 0}};
    Checked checked;
    optind = 0;
    opterr = 0;
    for (int found = 0; (found = getopt_long(count, command, "+p:evu:f:", longOptions, nullptr)) != -1;) {
        switch (found) {
            case 'p':
                checked.positions.push_back(std::strtoll(optarg, nullptr, 10));
                while (optind < count && command[optind][0] != '-') {
                    checked.positions.push_back(std::strtoll(command[optind++], nullptr, 10));
                }
                break;
            case 'e':
                checked.erase = true;
                break;
            case 'v':
                checked.verify = true;
                break;
            case 'u':
                checked.usercode = std::strtoull(optarg, nullptr, 16);
                break;
            case 'f':
                checked.file = optarg;
                break;
            default:
                break;
        }
    }
    return checked;
}

std::vector<char*> mutableWords() {
    std::vector<char*> pointers;
    for (const char* const word : words(true)) {
        pointers.push_back(const_cast<char*>(word));  // getopt_long changes none of them
    }
    return pointers;
}

void limit(benchmark::State& state) {
    const std::vector<char*> command = mutableWords();
    for (auto step : state) {
        const auto found = formats().find(command[0]);
        benchmark::DoNotOptimize(found->second.data());
        Checked checked = parseByGetopt(command.data(), static_cast<int>(command.size()));
        benchmark::DoNotOptimize(checked);
    }
}

// Peer: a parser built for the command and run on its words.

#if __has_include(<CLI/CLI.hpp>)

Checked parseByCli11(const std::vector<const char*>& command) {
    Checked checked;
    std::string usercode;
    CLI::App app("program");
    app.set_help_flag("");
    app.add_option("-p,--position", checked.positions)->required();
    app.add_flag("-e,--erase", checked.erase);
    app.add_flag("-v,--verify", checked.verify);
    app.add_option("-u,--usercode", usercode);
    app.add_option("--file", checked.file);
    app.parse(static_cast<int>(command.size()), command.data());
    checked.usercode = std::strtoull(usercode.c_str(), nullptr, 16);
    return checked;
}

void cli11Peer(benchmark::State& state) {
    const std::vector<const char*> command = words(true);
    for (auto step : state) {
        const auto found = formats().find(command[0]);
        benchmark::DoNotOptimize(found->second.data());
        Checked checked = parseByCli11(command);
        benchmark::DoNotOptimize(checked);
    }
}

std::vector<Side> peers() {
    return {{"CLI11", cli11Peer}};
}

bool agreesWithPeers(const Checked& checked) {
    return checked == parseByCli11(words(true));
}

#else

std::vector<Side> peers() {
    return {};
}

bool agreesWithPeers(const Checked&) {
    return true;
}

#endif

/// All sides read the same command; asked once, before the clock runs.
void requireAgreement() {
    static const bool agrees = [] {
        loadCommands();
        const std::vector<char*> command = mutableWords();
        const Checked checked = readByOurs();
        return checked == parseByGetopt(command.data(), static_cast<int>(command.size())) && agreesWithPeers(checked);
    }();
    if (!agrees) {
        throw std::logic_error("the sides read different commands");
    }
}

const RegisterItem command{
    {"parse_command", {"TessalCmdargs", ours}, peers(), {"map, getopt_long", limit}, 0.25, 4.00}};

}  // namespace
