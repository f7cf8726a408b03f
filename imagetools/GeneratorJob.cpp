#include "imagetools/GeneratorJob.h"

#include <utility>

#include "HkPath.h"
#include "HkStr.h"
#include "imagetools/PromParts.h"

namespace ImageTools {

// One text with the row of "generate" in the data file, so that a batch line takes what the generator takes.
const char* const generatorFormat =
    "'Write the files of the current mode' "
    "[-active <collection=text>] 'collection that the files belong to' "
    "[-path <directory=file>] 'where the files go' "
    "[-output <name=text>] 'name of the files; that of the first data file without it' "
    "[-format <format=mcs|exo|tek|hex|bin>] 'format of the files; mcs without it' "
    "[{-part <part=text>... 'listed parts in the order of their addresses' "
    "-size <bytes=text>... 'sizes in place of parts such as 65536 or 0x10000 or 64K' "
    "-generic 'for any PROM instead of a listed part'}] "
    "[-up <address=hex 1..8>]... 'place of the next data file and upwards' "
    "[-down <address=hex 1..8>]... 'place of the first byte of the next data file and downwards' "
    "[-data <data=file>]... 'data file (raw binary or *.elf or *.mem)' "
    "[-multiboot] 'several images in one PROM at borders of 64 KiB' "
    "[-offset <address=hex 1..8>...] 'or at these addresses (multiboot)' "
    "[-fillValue <byte=hex 1..2>] 'byte that fills the gaps' "
    "[-compressed] 'leave out rows that hold the fill byte alone' "
    "[-disableswap] 'keep the order of the bits in a byte' "
    "[\"\"]... 'no option (a marker of the option table)'";

namespace {

std::string quoted(const char* text) {
    return '"' + std::string(HkStr::View(text)) + '"';
}

/// The data files with the places told before them, in the order of the command.
Problem readPlaces(const HkCmdArgs& args, std::vector<DataFile>& files) {
    int ups = 0;
    int downs = 0;
    DataFile next;
    for (const HkString& name : args.order()) {
        const bool isUp = name == "-up";
        if (isUp || name == "-down") {
            if (next.address) {
                return "no -data stands between two addresses, " + hexText(*next.address) + " and the next";
            }
            next.goesDown = !isUp;
            next.address = args.hex(name, isUp ? ups++ : downs++);
        } else if (name == "-data") {
            next.path = args.text("-data", static_cast<int>(files.size()), "");
            files.push_back(next);
            next.address.reset();
        }
    }
    if (files.empty()) {
        return "no data file is named, expected -data <file>";
    }
    return next.address ? "no -data stands behind the address " + hexText(*next.address) : Problem();
}

/// Gives each file its offset; those that are not told are left to whoever knows the sizes.
Problem placeImages(const HkCmdArgs& args, GeneratorJob& job) {
    if (args.isGiven("-up") || args.isGiven("-down")) {
        return "-multiboot places the data files itself, so -up and -down do not go with it";
    }
    const auto offsets = static_cast<std::size_t>(args.valueCount("-offset"));
    if (offsets != 0 && offsets != job.files.size()) {
        return "-offset needs an address for each data file: " + countText(job.files.size(), "data file") + ", " +
               std::to_string(offsets) + " addresses";
    }
    job.alignsFiles = offsets == 0;
    for (std::size_t i = 0; i < offsets; ++i) {
        job.files[i].address = args.hex("-offset", static_cast<int>(i));
    }
    return {};
}

Problem readProms(const HkCmdArgs& args, GeneratorJob& job) {
    for (const HkString& part : args.list("-part")) {
        Prom prom{std::string(part.view()), 0};
        if (Problem problem = findPartSize(part, prom.size); !problem.empty()) {
            return problem;
        }
        job.proms.push_back(prom);
    }
    for (const HkString& text : args.list("-size")) {
        const std::optional<std::uint64_t> size = parseSize(text);
        if (!size) {
            return "-size needs a number of bytes from 1 to 4G, such as 65536, 0x10000 or 64K, not " + quoted(text);
        }
        job.proms.push_back({countText(*size, "byte"), *size});
    }
    job.isGeneric = args.isGiven("-generic");
    if (job.isGeneric) {
        job.proms.push_back({"generic", addressSpace});
    }
    if (job.proms.empty()) {
        return "no PROM is named, expected -part <part>, -size <bytes> or -generic";
    }
    if (job.capacity() > addressSpace) {
        return "the PROMs hold " + countText(job.capacity(), "byte") + " together, more than the 4 GiB of an address";
    }
    return {};
}

/// The path without the extension, if it is the wanted one or any is meant.
std::string withoutExtension(const std::string& path, const char* wanted) {
    const char* const extension = HkPath::GetExt(path.c_str(), nullptr);
    if (extension == nullptr || (wanted != nullptr && HkStr::ICompare(extension, wanted) != 0)) {
        return path;
    }
    return path.substr(0, path.size() - HkStr::Len(extension) - 1);
}

std::string lastComponent(const std::string& path) {
    return path.substr(path.find_last_of("/\\") + 1);  // npos + 1 is 0
}

Problem readOutput(const HkCmdArgs& args, GeneratorJob& job) {
    const char* const named = args.text("-output");
    std::string name = named != nullptr ? withoutExtension(named, job.format->name)
                                        : withoutExtension(lastComponent(job.files[0].path), nullptr);
    if (lastComponent(name).empty()) {
        return "-output needs a name for the files, not " + quoted(named);
    }
    job.title = args.text("-active", 0, lastComponent(name).c_str());
    const char* const directory = args.text("-path");
    job.output = directory != nullptr ? std::string(directory) + '/' + name : name;
    return {};
}

}  // namespace

std::uint64_t GeneratorJob::capacity() const {
    std::uint64_t sum = 0;
    for (const Prom& prom : proms) {
        sum += prom.size;
    }
    return sum;
}

std::string GeneratorJob::outputOf(std::size_t prom) const {
    return output + (proms.size() > 1 ? '_' + std::to_string(prom) : std::string()) + '.' + format->name;
}

Problem readJob(const HkCmdArgs& args, GeneratorJob& job) {
    job.format = &promFormat(args.text("-format", 0, "mcs"));
    job.fill = static_cast<unsigned char>(args.hex("-fillValue", 0, 0xFF));
    job.fillsGaps = args.isGiven("-fillValue") || !job.format->holdsAddresses;
    job.leavesFillOut = args.isGiven("-compressed");
    job.mirrorsBits = !args.isGiven("-disableswap");
    if (job.leavesFillOut && !job.format->holdsAddresses) {
        return std::string("-compressed needs a format with addresses, mcs, exo or tek, not ") + job.format->name;
    }
    Problem problem = readPlaces(args, job.files);
    if (problem.empty() && (args.isGiven("-multiboot") || args.isGiven("-offset"))) {
        problem = placeImages(args, job);
    }
    if (problem.empty()) {
        problem = readProms(args, job);
    }
    return problem.empty() ? readOutput(args, job) : problem;
}

}  // namespace ImageTools
