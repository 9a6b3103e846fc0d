// Scratch files and directories for tests, removed when the fixture goes.
#ifndef TARN_TESTS_TESTFILES_H
#define TARN_TESTS_TESTFILES_H

#include <string>
#include <vector>

class TempDir {
public:
    TempDir();
    ~TempDir();
    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;

    const std::string& path() const { return path_; }
    // Writes text (exact bytes) to path()/name, creating subdirectories; returns the full path.
    std::string write(const std::string& name, const std::string& text) const;
    std::string mkdir(const std::string& name) const;
    std::string operator/(const std::string& name) const { return path_ + "/" + name; }

private:
    std::string path_;
};

// Result of running a command through the shell.
struct CommandResult {
    int status;  // exit status, -1 when it did not exit normally
    std::string out;
    std::string err;
};

CommandResult runCommand(const std::string& command);
// Runs the built tarn binary with arguments (already shell-quoted as needed).
CommandResult runTarn(const std::string& arguments);
std::string readFile(const std::string& path);
// The pieces of text between separators (a final empty piece is dropped).
std::vector<std::string> split(const std::string& text, char sep);

#endif
