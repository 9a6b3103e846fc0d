// What the Verilog scanner knows while it reads: where it is, the text of the
// token just scanned and of the directive, comment or macro reference being
// collected, the open inputs (source file, include files, macro expansions),
// the files read so far and the pragma comments kept for the parser.
#ifndef TARN_TN_VERILOGSCANNERSTATE_H
#define TARN_TN_VERILOGSCANNERSTATE_H

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include "port/port_stream.h"
#include "src/tn_verilogoptions.h"
#include "util/tn_rcstring.h"
#include "verilog/tn_verilogfilelist.h"

class Tn_VerilogDirectiveState;

class Tn_VerilogScannerState {
public:
    // One open input. The bottom one is the current source file (or the text
    // the scanner was started on); each include file and each macro expansion
    // opens another on top and keeps the location to return to.
    class Input {
    public:
        enum Kind { SOURCE_FILE, INCLUDE_FILE, MACRO, TEXT };

        // A file input over an open stream (owned), or a text input.
        Input(Kind kind, const Port_String& name, Port::Stream* stream);
        Input(Kind kind, const Port_String& name, std::string text);
        ~Input();
        Input(const Input&) = delete;
        Input& operator=(const Input&) = delete;

        // Up to size bytes of the input; 0 at its end.
        size_t read(char* buf, size_t size);

        Kind kind() const { return kind_; }
        bool isFile() const { return kind_ == SOURCE_FILE || kind_ == INCLUDE_FILE; }
        // The file's path as opened, or the macro's name.
        const Port_String& name() const { return name_; }
        // Length of a text input (a macro expansion).
        size_t textLength() const { return text_.size(); }
        // Whether this input reads the same file as a stream (however the
        // two were named); the size of a regular file (-1 when unknown).
        bool sameFile(const Port::Stream::FileId& id) const;
        const Port::Stream::FileId* fileId() const { return hasId_ ? &id_ : nullptr; }

        // Where scanning resumes when this input ends (set for includes and
        // macro expansions).
        Tn_RCStringPtr returnFile;
        int returnLine = 0;
        int returnColumn = 1;

    private:
        Kind kind_;
        Port_String name_;
        Port::Stream* stream_;
        Port::Stream::FileId id_;
        bool hasId_ = false;
        bool ended_ = false;
        std::string text_;
        size_t pos_ = 0;
    };

    Tn_VerilogScannerState(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives);
    ~Tn_VerilogScannerState();

    const Tn_VerilogOptions& options() const { return *options_; }
    Tn_VerilogDirectiveState& directives() const { return *directives_; }

    // The location of messages and tokens: file name (after includes and
    // `line), line, and the column after the last character read.
    Tn_RCStringPtr file;
    int line = 0;
    int column = 1;
    // "\"file\" line N ", "\"file\" " (line below 1), "line N " (no file),
    // or empty: the prefix of every message about the source.
    static Port_String locationText(const std::string& file, int line);
    Port_String locationText() const;
    const std::string& fileName() const;
    void setFile(const Port_String& name) { file = Tn_RCString::create(name.str()); }

    // Text of the token just scanned.
    std::string text;
    // Text collected for a `define, a comment, a string literal, the
    // arguments of a macro reference.
    std::string defineBuffer;
    int defineLine = 0;
    std::string commentBuffer;
    std::string stringBuffer;
    std::string macroBuffer;
    int macroDepth = 0;
    bool macroInString = false;
    int macroLine = 0;
    // Newlines inside macro arguments: counted when the expansion ends.
    int pendingLines = 0;

    // Inputs, bottom first.
    std::vector<std::unique_ptr<Input>> inputs;
    Input& input() { return *inputs.back(); }
    // Path of the innermost file being read (the includer of an include).
    Port_String currentFilePath() const;
    // Macro expansions open on top of the innermost file, and their total text.
    int openExpansions = 0;
    size_t openExpansionBytes = 0;

    // The source files of the compilation and the next one to open.
    Tn_StringList sourceFiles;
    size_t nextSource = 0;
    // Every source and include file opened, with its includer.
    Tn_VerilogFileList fileList;
    // Attribute pragma comments, for the parser (+pls_client).
    std::vector<Port_String> pragmaComments;
    // Status messages name the work library as well.
    bool announceLibrary = false;
    // Bytes read from files (the throughput of the scanner is measured on them).
    size_t bytesRead = 0;
    // Bytes of macro expansion text made so far, nested or not.
    size_t expandedBytes = 0;
    // Include files opened so far, and how many a compilation may open:
    // files that each include the next one twice open exponentially many
    // without any being recursive (about 20 s at the default bound).
    size_t includesOpened = 0;
    static constexpr size_t kMaxIncludes = 1000000;
    size_t includeLimit = kMaxIncludes;

private:
    const Tn_VerilogOptions* options_;
    Tn_VerilogDirectiveState* directives_;
};

#endif
