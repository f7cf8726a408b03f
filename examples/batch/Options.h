// What the batch prompt was called with.
#pragma once

#include <string>

struct Options {
    enum class Task { RunScript, Prompt, Complete, ShowHelp, Refuse };

    Task task = Task::Refuse;
    std::string script;    ///< path of the script, "-" for standard input
    std::string line;      ///< the line to complete
    std::string dataPath;  ///< directories of the data files; empty where none are given
    std::string hostRoot;  ///< directory that stands for "/" when ports are looked for; empty for "/" itself
    bool stopOnError = false;
};

/// Reads the command line. What does not fit is reported, and the task is Refuse.
Options readOptions(int argc, char** argv);

/// How the program is called, in many lines.
std::string optionsHelp();
