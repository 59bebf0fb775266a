#ifndef QRX_MODEL_FILE_MDF_DIAGNOSTICS_H
#define QRX_MODEL_FILE_MDF_DIAGNOSTICS_H

#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Value.h"

/// A place in a document, as a chain of tokens on the call stack; its text is made only for a message.
class mdf_Path {
public:
    mdf_Path() = default;
    mdf_Path(const mdf_Path& parent, std::string_view token) : parent_(&parent), token_(token) {}
    mdf_Path(const mdf_Path& parent, std::size_t index) : parent_(&parent), index_(index), isIndex_(true) {}
    /// The JSON pointer.
    std::string Text() const;

private:
    const mdf_Path* parent_ = nullptr; // null: the document
    std::string_view token_;
    std::size_t index_ = 0;
    bool isIndex_ = false;
};

/// Collects what there is to say; keeps at most fifty errors and as many warnings.
class mdf_Diagnostics {
public:
    explicit mdf_Diagnostics(mdf_Report& report) : report_(&report) {}
    void Error(const std::string& pointer, const std::string& text) { Add(true, pointer, text); }
    void Error(const mdf_Path& path, const std::string& text) { Add(true, path.Text(), text); }
    void Warning(const std::string& pointer, const std::string& text) { Add(false, pointer, text); }
    void Warning(const mdf_Path& path, const std::string& text) { Add(false, path.Text(), text); }
    /// "found <value>, expected <expected>".
    void Expected(const mdf_Path& path, const mdf_Value& found, const std::string& expected);
    int NumErrors() const { return numErrors_; }

private:
    void Add(bool isError, const std::string& pointer, const std::string& text);

    mdf_Report* report_;
    int numErrors_ = 0;
    int numWarnings_ = 0;
};

/// Hands on what the store finds, below a path.
class mdf_StoreProblems : public odiK_Problems {
public:
    mdf_StoreProblems(mdf_Diagnostics& diagnostics, const mdf_Path& path)
        : diagnostics_(diagnostics), path_(path) {}
    void Error(const std::string& place, const std::string& text) override {
        diagnostics_.Error(path_.Text() + place, text);
    }
    void Warning(const std::string& place, const std::string& text) override {
        diagnostics_.Warning(path_.Text() + place, text);
    }

private:
    mdf_Diagnostics& diagnostics_;
    const mdf_Path& path_;
};

/// A value as messages show it: short texts and numbers as they stand, else what kind of thing it is.
std::string mdf_Shown(const mdf_Value& value);
std::string mdf_Shown(double value);
std::string mdf_Quoted(std::string_view text);

/// The known name that is nearest to `name`, as "; did you mean 'x'?", or nothing when none is near.
std::string mdf_DidYouMean(std::string_view name, const std::vector<std::string>& known);
/// "one of a, b, c".
std::string mdf_OneOf(const std::vector<std::string>& words);

/// Why the text can't stand in a deck as a name; empty when it can.
std::string mdf_NameProblem(std::string_view name);

/// Finds names of one kind that differ only in capitals.
class mdf_CapitalsCheck {
public:
    /// Warns at the path if an earlier name equals this one but for capitals.
    void Enter(const std::string& name, const mdf_Path& path, const char* kind, mdf_Diagnostics& diagnostics);

private:
    std::map<std::string, std::string> byLowerCase_;
};

#endif
