#pragma once
#include <string>

namespace quire::test {

// Runs a shell command; returns its exit status and fills `output` with what it printed.
int runCommand(const std::string& command, std::string* output = nullptr);
// True when the program can be found on the PATH.
bool haveProgram(const std::string& name);
// Debian's python3 with the spreadsheet modules (not a virtual environment's).
std::string systemPython();
// True when the system python can import the module.
bool havePythonModule(const std::string& module);
// Single-quoted for the shell.
std::string shellQuote(const std::string& text);

}  // namespace quire::test
