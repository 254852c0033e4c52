#include "tests/xls/support/readers.h"

#include "tests/xls/support/tempdir.h"

#include <cstdlib>
#include <fstream>
#include <sstream>

#ifndef _WIN32
#include <sys/wait.h>
#endif

#ifndef PENMOOR_XLS_INTEROP_DIR
#error "PENMOOR_XLS_INTEROP_DIR must name the folder of the helper scripts"
#endif

namespace penmoor::xls::test {

namespace {

const char* const kPython = "/usr/bin/python3";

std::string quote(const std::string& word)
{
    std::string quoted = "'";
    for (char c : word) {
        if (c == '\'')
            quoted += "'\\''";
        else
            quoted += c;
    }
    return quoted + "'";
}

std::string readWhole(const std::filesystem::path& path)
{
    std::ifstream in(path, std::ios::binary);
    std::ostringstream text;
    text << in.rdbuf();
    return text.str();
}

} // namespace

CommandResult runCommand(const std::vector<std::string>& arguments, int timeoutSeconds)
{
    TempDir folder;
    std::string line = "timeout " + std::to_string(timeoutSeconds);
    for (const std::string& word : arguments)
        line += " " + quote(word);
    line += " >" + quote(folder.file("out").string()) + " 2>" + quote(folder.file("err").string()) + " </dev/null";
    const int status = std::system(line.c_str());
    CommandResult result;
#ifdef _WIN32
    result.exitCode = status;
#else
    result.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
#endif
    result.output = readWhole(folder.file("out"));
    result.errors = readWhole(folder.file("err"));
    return result;
}

bool hasPythonModule(const std::string& module)
{
    return std::filesystem::exists(kPython) && runCommand({ kPython, "-c", "import " + module }).exitCode == 0;
}

bool hasProgram(const std::string& program)
{
    return runCommand({ "sh", "-c", "command -v " + quote(program) }).exitCode == 0;
}

bool readersRequired()
{
    const char* value = std::getenv("PENMOOR_REQUIRE_READERS");
    return value != nullptr && std::string(value) == "1";
}

std::string interopScript(const std::string& name)
{
    return std::string(PENMOOR_XLS_INTEROP_DIR) + "/" + name;
}

std::string runPythonScript(const std::string& script, const std::vector<std::string>& arguments)
{
    std::vector<std::string> words { kPython, interopScript(script) };
    words.insert(words.end(), arguments.begin(), arguments.end());
    const CommandResult result = runCommand(words);
    EXPECT_EQ(result.exitCode, 0) << script << " failed:\n" << result.errors;
    return result.output;
}

std::filesystem::path convertWithLibreOffice(
    const std::filesystem::path& input, const std::string& format, const std::filesystem::path& outDir)
{
    TempDir profile;
    const CommandResult result = runCommand({ "soffice", "-env:UserInstallation=file://" + profile.path().string(),
        "--headless", "--norestore", "--convert-to", format, "--outdir", outDir.string(), input.string() });
    const std::string extension = format.substr(0, format.find(':'));
    auto converted = outDir / input.filename().replace_extension(extension);
    if (result.exitCode != 0 || !std::filesystem::exists(converted)) {
        ADD_FAILURE() << "LibreOffice did not convert " << input << " to " << format << ":\n"
                      << result.output << result.errors;
        return {};
    }
    return converted;
}

std::vector<std::string> lines(const std::string& text)
{
    std::vector<std::string> result;
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);) {
        if (!line.empty())
            result.push_back(line);
    }
    return result;
}

} // namespace penmoor::xls::test
