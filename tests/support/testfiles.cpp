#include "tests/support/testfiles.h"

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

TempDir::TempDir() {
    const char* base = std::getenv("TMPDIR");
    std::string tmpl = std::string(base && *base ? base : "/tmp") + "/tarn-test-XXXXXX";
    if (!mkdtemp(&tmpl[0])) throw std::runtime_error("mkdtemp failed");
    path_ = tmpl;
}

TempDir::~TempDir() {
    const std::string cmd = "rm -rf '" + path_ + "'";
    if (std::system(cmd.c_str()) != 0) std::fprintf(stderr, "could not remove %s\n", path_.c_str());
}

std::string TempDir::mkdir(const std::string& name) const {
    std::string full = path_;
    std::stringstream parts(name);
    for (std::string part; std::getline(parts, part, '/');) {
        full += "/" + part;
        ::mkdir(full.c_str(), 0777);
    }
    return full;
}

std::string TempDir::write(const std::string& name, const std::string& text) const {
    const size_t slash = name.rfind('/');
    if (slash != std::string::npos) mkdir(name.substr(0, slash));
    const std::string full = path_ + "/" + name;
    std::ofstream out(full, std::ios::binary);
    out << text;
    return full;
}

std::string readFile(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    std::stringstream ss;
    ss << in.rdbuf();
    return ss.str();
}

CommandResult runCommand(const std::string& command) {
    TempDir tmp;
    const std::string out = tmp / "out", err = tmp / "err";
    const std::string full = command + " >'" + out + "' 2>'" + err + "'";
    const int raw = std::system(full.c_str());
    CommandResult r;
    r.status = (raw != -1 && WIFEXITED(raw)) ? WEXITSTATUS(raw) : -1;
    r.out = readFile(out);
    r.err = readFile(err);
    return r;
}

CommandResult runTarn(const std::string& arguments) { return runCommand(std::string(TARN_BIN) + " " + arguments); }

std::vector<std::string> split(const std::string& text, char sep) {
    std::vector<std::string> r;
    std::stringstream in(text);
    for (std::string piece; std::getline(in, piece, sep);) r.push_back(piece);
    return r;
}
