#include "IF_IMAGEGEN.h"

#include <filesystem>
#include <system_error>

#include "HkFile.h"
#include "imagetools/ContentPieces.h"
#include "imagetools/GeneratorJob.h"
#include "imagetools/PromFileSet.h"
#include "imagetools/PromImage.h"
#include "imagetools/Records.h"
#include "imagetools/WriteProgress.h"
#include "s/ByteSum.h"
#include "s/UnitOrigin.h"

namespace {

using namespace ImageTools;

constexpr UnitOrigin origin{"../s/IF_IMAGEGEN", "$Revision: 1.1 $"};

bool isSameFile(const std::string& a, const std::string& b) {
    std::error_code error;
    return std::filesystem::equivalent(std::filesystem::u8path(a), std::filesystem::u8path(b), error);
}

/// The sum of all bytes of a PROM in 32 bits; those that the data leaves open count as the fill.
std::uint32_t checksumOf(const std::vector<Segment>& data, std::uint64_t size, unsigned char fill) {
    std::uint32_t sum = 0;
    for (const Segment& segment : data) {
        sum += static_cast<std::uint32_t>(sumBytes(segment.data, segment.size));
        size -= segment.size;
    }
    return sum + static_cast<std::uint32_t>(size) * fill;
}

/// One run of the generator.
class Run {
public:
    Problem perform(const HkCmdArgs& args) {
        Problem problem = readJob(args, m_job);
        if (problem.empty()) {
            problem = checkFiles();
        }
        if (problem.empty()) {
            problem = m_image.load(m_job);
        }
        return problem.empty() ? writeAll() : problem;
    }

    /// One line for each PROM.
    void report() const {
        for (const std::string& line : m_summary) {
            origin.report().issueStatus("%s\n", line.c_str());
        }
    }

private:
    Problem writeAll() {
        WriteProgress progress("Generating " + m_job.output + '.' + m_job.format->name, blocksExpected());
        Problem problem = writeProms();
        if (problem.empty()) {
            problem = m_files.putInPlace();
        }
        if (problem.empty()) {
            progress.complete();
        }
        return problem;
    }

    /// How many blocks of text the files will take, not counting what fills gaps between them.
    std::uint64_t blocksExpected() const {
        std::uint64_t bytes = 0;
        for (const Segment& segment : m_image.segments().all()) {
            bytes += segment.size;
        }
        return bytes / rowSize * m_job.format->rowLength / RecordSink::blockSize + m_job.proms.size();
    }

    /// No file of the run may take the place of its own data.
    Problem checkFiles() const {
        for (std::size_t i = 0; i < m_job.proms.size(); ++i) {
            const std::string output = m_job.outputOf(i);
            for (const DataFile& file : m_job.files) {
                if (isSameFile(output, file.path)) {
                    return output + " is a data file and would be replaced; choose another -output or -path";
                }
            }
        }
        return {};
    }

    Problem writeProms() {
        const FillBlock fill(m_job.fill);
        std::uint64_t first = 0;
        for (std::size_t i = 0; i < m_job.proms.size(); ++i) {
            const Prom& prom = m_job.proms[i];
            if (Problem problem = writeProm(i, first, fill); !problem.empty()) {
                return problem;
            }
            first += prom.size;
        }
        return {};
    }

    Problem writeProm(std::size_t number, std::uint64_t first, const FillBlock& fill) {
        const Prom& prom = m_job.proms[number];
        PromContent content{m_image.segments().slice(first, first + prom.size), m_job.title};
        const std::string name =
            "PROM " + std::to_string(number + 1) + " of " + std::to_string(m_job.proms.size()) + " (" + prom.name + ')';
        if (content.pieces.empty()) {
            m_summary.push_back(name + ": no data, no file");
            return {};
        }
        for (Segment& piece : content.pieces) {
            piece.address -= first;
        }
        const std::uint64_t lowest = content.pieces.front().address;
        const std::uint64_t size = m_job.isGeneric ? content.end() - lowest : prom.size;
        const std::string path = m_job.outputOf(number);
        m_summary.push_back(name + ": " + path + ", " + rangeText(lowest, content.end()) + ", checksum " +
                            hexText(checksumOf(content.pieces, size, m_job.fill), 8));
        if (m_job.fillsGaps) {
            if (Problem problem = fillGaps(content.pieces, fill); !problem.empty()) {
                return path + ": " + problem;
            }
        }
        if (m_job.leavesFillOut) {
            dropFill(content.pieces, m_job.fill);
        }
        return m_files.write(path, *m_job.format, content);
    }

    GeneratorJob m_job;
    PromImage m_image;
    PromFileSet m_files;
    std::vector<std::string> m_summary;
};

Problem argumentProblem(const HkCmdArgs* command) {
    if (command == nullptr) {
        return "there is no command";
    }
    return command->iserror() != 0 ? "its arguments do not fit" : Problem();
}

}  // namespace

const char* IF_IMAGEGEN::getcmdformat() {
    return generatorFormat;
}

IF_IMAGEGEN::IF_IMAGEGEN(const HkCmdArgs* command) : m_command(command) {}

unsigned char IF_IMAGEGEN::makeprom() {
    Run run;
    Problem problem = argumentProblem(m_command);
    if (problem.empty()) {
        problem = run.perform(*m_command);
    }
    if (!problem.empty()) {
        const char* const end = problem.back() == '?' ? "" : ".";
        origin.report().issueInfo("No PROM file is generated: %s%s\n", problem.c_str(), end);
        return 1;
    }
    run.report();
    return 0;
}
