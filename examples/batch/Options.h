// What the batch prompt was called with.
#pragma once

#include <string>
#include <vector>

struct Options {
    enum class Task { RunScript, RunCommand, Prompt, Complete, CompleteWords, ShowHelp, Refuse };

    Task task = Task::Refuse;
    std::string script;  ///< path of the script, "-" for standard input
    std::string line;    ///< the line to complete
    /// The one command to run, or what was typed so far behind the program's name on a shell's command line.
    std::vector<std::string> words;
    std::string dataPath;  ///< directories of the data files; empty where none are given
    std::string hostRoot;  ///< directory that stands for "/" when ports are looked for; empty for "/" itself
    bool stopOnError = false;
};

/// Reads the command line. What does not fit is reported, and the task is Refuse.
Options readOptions(int argc, char** argv);

/// How the program is called, in many lines.
std::string optionsHelp();

/// The argument format of the program itself.
const char* optionsFormat();

/// The place of the switch -c, behind which all words are one command; the number of the words where it is not among
/// them.
std::size_t placeOfCommand(const std::vector<std::string>& words);
