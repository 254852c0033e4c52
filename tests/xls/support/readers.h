#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include <gtest/gtest.h>

// Running the independent readers of .xls files: Debian's python3-xlrd and python3-olefile
// (always through /usr/bin/python3, the interpreter that sees Debian's modules), Gnumeric's
// ssconvert and LibreOffice headless.
namespace penmoor::xls::test {

struct CommandResult {
    int exitCode = -1;
    std::string output; // standard output
    std::string errors; // standard error
};

// Runs a program with these arguments (each passed as one word), waiting at most the given
// time, and captures what it prints.
CommandResult runCommand(const std::vector<std::string>& arguments, int timeoutSeconds = 300);

bool hasPythonModule(const std::string& module);
bool hasProgram(const std::string& program);
// True when PENMOOR_REQUIRE_READERS=1 (CI): a missing reader then fails the test.
bool readersRequired();

// The path of one of the Python helper scripts beside these tests.
std::string interopScript(const std::string& name);

// Runs one of the helper scripts with /usr/bin/python3; fails the test on a non-zero exit.
std::string runPythonScript(const std::string& script, const std::vector<std::string>& arguments);

// Converts a file with LibreOffice headless into outDir, with a private profile folder that is
// created and removed here; returns the converted file's path (empty on failure, with the
// reason in the test log).
std::filesystem::path convertWithLibreOffice(
    const std::filesystem::path& input, const std::string& format, const std::filesystem::path& outDir);

// Lines of text split at '\n', without empty lines.
std::vector<std::string> lines(const std::string& text);

} // namespace penmoor::xls::test

// Skips the test loudly when a reader is missing, or fails it when readers are required.
#define PENMOOR_NEED_READER(available, what)                                                                           \
    do {                                                                                                               \
        if (!(available)) {                                                                                            \
            if (::penmoor::xls::test::readersRequired())                                                               \
                FAIL() << "the independent reader " << (what) << " is missing (PENMOOR_REQUIRE_READERS=1)";            \
            GTEST_SKIP() << "SKIPPED: the independent reader " << (what) << " is not installed";                       \
        }                                                                                                              \
    } while (false)
