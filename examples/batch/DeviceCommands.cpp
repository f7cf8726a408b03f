#include "DeviceCommands.h"

#include <cstdio>
#include <optional>
#include <string>

#include "Chain.h"
#include "DataFile.h"
#include "OptionCommands.h"
#include "PromTransfer.h"
#include "Quoting.h"
#include "Session.h"
#include "Verify.h"

namespace {

using ImageStep = std::function<bool(const Prom&, const Bytes& image)>;

/// The image for a PROM, from the file that is assigned to its position. False after a message.
bool readImage(const Prom& prom, Bytes& image) {
    const std::string& file = prom.session.assignedFile(prom.position);
    if (file.empty()) {
        return prom.fail("no file is assigned; assignfile does that");
    }
    const std::string problem = readBytes(file, image);
    if (!problem.empty()) {
        return prom.fail(quotedWhereNeeded(file) + ' ' + problem);
    }
    return image.size() <= static_cast<std::size_t>(prom.size) ||
           prom.fail(quotedWhereNeeded(file) + " holds " + std::to_string(image.size()) + " bytes, the PROM " +
                     std::to_string(prom.size));
}

bool forEachImage(Session& session, const HkCmdArgs& args, const ImageStep& step) {
    return forEachProm(session, args, [&](Prom& prom) {
        Bytes image;
        return readImage(prom, image) && step(prom, image);
    });
}

bool writeContent(const Prom& prom, const std::string& path, int length) {
    NewFile file(path);
    const auto write = [&](int, const unsigned char* block, int count) -> std::string {
        return file.write(block, static_cast<std::size_t>(count)) ? "" : quotedWhereNeeded(path) + " cannot be written";
    };
    if (!readBlocks(prom, "reading back", length, write)) {
        return false;
    }
    if (!file.complete()) {
        return prom.fail(quotedWhereNeeded(path) + " cannot be written");
    }
    std::printf("  position %d: %d bytes in %s\n", prom.position + 1, length, quotedWhereNeeded(path).c_str());
    return true;
}

}  // namespace

bool identify(Session& session, const HkCmdArgs&) {
    return withChain(session, [](Chain& chain) {
        int position = 0;
        for (const ChainDevice& device : chain.devices()) {
            std::printf("  position %d: %s, device code %08X\n", ++position, quotedWhereNeeded(device.name).c_str(),
                        static_cast<unsigned int>(device.idCode));
        }
        return true;
    });
}

bool assignFile(Session& session, const HkCmdArgs& args) {
    session.assignedFile(static_cast<int>(args.integer("-p"))) = args.text("-file", 0, "");
    return true;
}

bool erase(Session& session, const HkCmdArgs& args) {
    takeOptions(args);
    return forEachProm(session, args, eraseProm);
}

bool program(Session& session, const HkCmdArgs& args) {
    const DeviceOptionsMgr options = takeOptions(args);
    const bool erases =
        options.isOptionSet(tESSALNS::ERASE_B4_PROGRAMMING) || isPreferred(TessalPreference::ERASE_BEFORE_PROGRAM);
    const bool verifies = options.isOptionSet(tESSALNS::VERIFY) || isPreferred(TessalPreference::VERIFY_AFTER_PROGRAM);
    return forEachImage(session, args, [&](const Prom& prom, const Bytes& image) {
        return (!erases || eraseProm(prom)) && programProm(prom, image) && (!verifies || verifyProm(prom, image));
    });
}

bool verify(Session& session, const HkCmdArgs& args) {
    takeOptions(args);
    return forEachImage(session, args, verifyProm);
}

bool readback(Session& session, const HkCmdArgs& args) {
    const HkString file = takeOptions(args).getOptionString(tESSALNS::READBACK_FILE);
    return forEachProm(session, args, [&](Prom& prom) {
        const std::string path(file.view());
        if (path.empty()) {
            return prom.fail("no file is given; -file names it");
        }
        if (isTextFormat(path)) {
            return prom.fail(quotedWhereNeeded(path) +
                             " would be a binary file; generate writes other formats from one");
        }
        if (HkFile::exist(path.c_str()) && !isPreferred(TessalPreference::FILE_OVERWRITE)) {
            return prom.fail(quotedWhereNeeded(path) + " is there already; preference FileOverwrite True replaces it");
        }
        Bytes image;
        const bool isAssigned = !session.assignedFile(prom.position).empty();
        return (!isAssigned || readImage(prom, image)) &&
               writeContent(prom, path, isAssigned ? static_cast<int>(image.size()) : prom.size);
    });
}
