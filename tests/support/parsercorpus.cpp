#include "tests/support/parsercorpus.h"

#include <dirent.h>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <unistd.h>

namespace {

std::vector<std::string> words(const std::string& text) {
    std::vector<std::string> r;
    std::istringstream in(text);
    for (std::string w; in >> w;) r.push_back(w);
    return r;
}

std::vector<std::string> listSeparated(const std::string& text, const std::string& sep) {
    std::vector<std::string> r;
    if (text.empty()) return r;
    for (size_t at = 0;;) {
        const size_t next = text.find(sep, at);
        r.push_back(text.substr(at, next == std::string::npos ? std::string::npos : next - at));
        if (next == std::string::npos) return r;
        at = next + sep.size();
    }
}

}  // namespace

std::string parserCorpusDir() { return std::string(TARN_TEST_DATA) + "/parser"; }

std::string sharedCorpusDir() { return std::string(TARN_SHARED_DIR) + "/corpus/designs"; }

bool readSharedDesigns(std::vector<SharedDesign>& designs) {
    std::ifstream manifest(sharedCorpusDir() + "/MANIFEST.tsv");
    if (!manifest) return false;
    std::string line;
    std::getline(manifest, line);  // column names
    while (std::getline(manifest, line)) {
        const std::vector<std::string> col = split(line, '\t');
        if (col.size() < 8) throw std::runtime_error("malformed shared corpus manifest line: " + line);
        SharedDesign d;
        d.name = col[0];
        const std::string base = sharedCorpusDir() + "/" + col[0] + "/";
        for (const std::string& f : words(col[5])) d.args.push_back(base + f);
        for (const std::string& i : words(col[6])) d.args.push_back("+incdir+" + base + i);
        for (const std::string& m : words(col[7])) d.args.push_back("+define+" + m);
        d.tops = words(col[4]);
        designs.push_back(d);
    }
    return true;
}

std::vector<CorpusCase> readParserCorpus() {
    std::vector<CorpusCase> cases;
    std::istringstream in(readFile(parserCorpusDir() + "/MANIFEST.tsv"));
    std::string line;
    std::getline(in, line);  // header
    while (std::getline(in, line)) {
        if (line.empty()) continue;
        std::vector<std::string> c = split(line, '\t');
        c.resize(11);
        CorpusCase k;
        k.name = c[0];
        k.files = words(c[1]);
        k.includeDirs = words(c[2]);
        k.defines = words(c[3]);
        k.mode = c[4];
        k.tops = words(c[5]);
        k.faultFiles = words(c[6]);
        k.faultLevels = listSeparated(c[7], " || ");
        k.faultMessages = listSeparated(c[8], " || ");
        k.notes = c[10];
        cases.push_back(k);
    }
    return cases;
}

std::vector<CorpusCase> readParserCompilations() {
    std::vector<CorpusCase> first;
    for (const CorpusCase& c : readParserCorpus())
        if (first.empty() || first.back().compilation() != c.compilation()) first.push_back(c);
    return first;
}

std::vector<std::string> CorpusCase::args(const std::vector<std::string>& fileList, const std::string& dir) const {
    const std::string prefix = dir.empty() ? "" : dir + "/";
    std::vector<std::string> r;
    for (const std::string& f : fileList) r.push_back(prefix + f);
    for (const std::string& d : includeDirs) r.push_back("+incdir+" + prefix + d);
    for (const std::string& d : defines) r.push_back("+define+" + d);
    if (mode == "1995") r.push_back("-1995");
    return r;
}

std::string applyUnifiedDiff(const std::string& original, const std::string& diff) {
    const std::vector<std::string> in = split(original, '\n');
    std::vector<std::string> out;
    size_t next = 0;  // first line of in not yet copied
    std::istringstream d(diff);
    std::string l;
    bool inHunk = false;
    bool finalNewline = !original.empty() && original.back() == '\n';
    char last = 0;
    while (std::getline(d, l)) {
        if (l.compare(0, 3, "---") == 0 || l.compare(0, 3, "+++") == 0) continue;
        if (l.compare(0, 2, "@@") == 0) {
            const size_t start = std::stoul(l.substr(4));  // "@@ -start,count ..."
            const size_t from = start ? start - 1 : 0;
            if (from < next || from > in.size()) throw std::runtime_error("hunk out of order: " + l);
            out.insert(out.end(), in.begin() + static_cast<long>(next), in.begin() + static_cast<long>(from));
            next = from;
            inHunk = true;
            continue;
        }
        if (!inHunk || l.empty()) continue;
        if (l[0] == '\\') {  // "\ No newline at end of file" for the line before
            finalNewline = last == '-';
            continue;
        }
        last = l[0];
        const std::string body = l.substr(1);
        if (l[0] == '+') {
            out.push_back(body);
        } else if (next < in.size() && in[next] == body) {
            if (l[0] == ' ') out.push_back(body);
            ++next;
        } else {
            throw std::runtime_error("hunk does not match at line " + std::to_string(next + 1) + ": " + l);
        }
    }
    out.insert(out.end(), in.begin() + static_cast<long>(next), in.end());
    std::string r;
    for (size_t i = 0; i < out.size(); ++i) r += out[i] + (i + 1 < out.size() || finalNewline ? "\n" : "");
    return r;
}

void materializeParserCorpus(const TempDir& dir) {
    const std::string src = parserCorpusDir();
    for (const char* sub : {"clean", "include"})
        if (symlink((src + "/" + sub).c_str(), (dir / sub).c_str()) != 0) throw std::runtime_error("symlink failed");
    dir.mkdir("faulty");
    DIR* d = opendir((src + "/faulty").c_str());
    if (!d) throw std::runtime_error("no faulty directory");
    while (dirent* e = readdir(d)) {
        const std::string name = e->d_name;
        if (name.size() < 6 || name.substr(name.size() - 5) != ".diff") continue;
        const std::string base = name.substr(0, name.size() - 5);
        const std::string clean = base.substr(0, base.rfind('-'));
        dir.write("faulty/" + base + ".v",
                  applyUnifiedDiff(readFile(src + "/clean/" + clean + ".v"), readFile(src + "/faulty/" + name)));
    }
    closedir(d);
}

void ParserCorpusTest::SetUp() {
    materializeParserCorpus(dir);
    char buf[4096];
    ASSERT_TRUE(getcwd(buf, sizeof buf));
    previous = buf;
    ASSERT_EQ(chdir(dir.path().c_str()), 0);
}

void ParserCorpusTest::TearDown() { EXPECT_EQ(chdir(previous.c_str()), 0); }
