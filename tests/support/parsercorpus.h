// The parser corpus under tests/data/parser: clean compilations, faulty
// variants stored as unified diffs, and the manifest that says what each
// variant must draw.
#ifndef TARN_TESTS_PARSERCORPUS_H
#define TARN_TESTS_PARSERCORPUS_H

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/testfiles.h"

struct CorpusCase {
    std::string name;  // "<compilation>/<fault>"
    std::vector<std::string> files, includeDirs, defines;
    std::string mode;  // "2001" or "1995"
    std::vector<std::string> tops;
    std::vector<std::string> faultFiles;
    std::vector<std::string> faultLevels;    // "error" / "warning", one per message
    std::vector<std::string> faultMessages;  // exact texts, or "syntax@<file>:<line>"
    std::string notes;

    // "<compilation>" of the name.
    std::string compilation() const { return name.substr(0, name.find('/')); }
    // The command line of a file list: dir/file for each file (as given when
    // dir is empty), include directories (under dir too), macros and mode.
    std::vector<std::string> args(const std::vector<std::string>& fileList, const std::string& dir = "") const;
};

// One design of the shared corpus of real designs: its directory name, its
// command line (files, include directories, macros) and its top modules.
struct SharedDesign {
    std::string name;
    std::vector<std::string> args;
    std::vector<std::string> tops;
};
// Where the shared corpus is (TARN_SHARED_DIR/corpus/designs).
std::string sharedCorpusDir();
// Its designs, in manifest order; false when the corpus is not there.
bool readSharedDesigns(std::vector<SharedDesign>& designs);

// Every row of the manifest, in order.
std::vector<CorpusCase> readParserCorpus();
// The first row of each compilation, in order.
std::vector<CorpusCase> readParserCompilations();
// The corpus directory in the source tree.
std::string parserCorpusDir();
// Applies a unified diff (as diff -u writes it) to text; throws
// std::runtime_error when a hunk does not match.
std::string applyUnifiedDiff(const std::string& original, const std::string& diff);
// Lays the corpus out in dir as it stands in the source tree, with every
// faulty variant made into its file under faulty/.
void materializeParserCorpus(const TempDir& dir);

// A fixture that runs from inside the laid-out corpus (its file names are
// relative to it).
class ParserCorpusTest : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    TempDir dir;
    std::string previous;
};

#endif
