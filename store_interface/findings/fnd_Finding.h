#ifndef QRX_STORE_FND_FINDING_H
#define QRX_STORE_FND_FINDING_H

#include "store_interface/findings/fnd_Codes.h"

#include <string>
#include <string_view>
#include <vector>

/// A place in a model or its file, as a chain of tokens on the call stack; its text is made only for a
/// finding.
class fnd_Path {
public:
    fnd_Path() = default;
    fnd_Path(const fnd_Path& parent, std::string_view token) : parent_(&parent), token_(token) {}
    fnd_Path(const fnd_Path& parent, std::size_t index) : parent_(&parent), index_(index), isIndex_(true) {}
    /// The JSON pointer (RFC 6901).
    std::string Text() const;

private:
    const fnd_Path* parent_ = nullptr; // null: the whole
    std::string_view token_;
    std::size_t index_ = 0;
    bool isIndex_ = false;
};

/// Appends "/" and the token, as a JSON pointer spells it.
void fnd_AppendPointer(std::string& pointer, std::string_view token);
/// Whether the place is the pointer's or lies below it. All are below "".
bool fnd_IsBelow(std::string_view place, std::string_view pointer);

/// Something to say about a model: what, where, and how to mend it.
struct fnd_Finding {
    const fnd_Code* code = nullptr;
    /// JSON pointer; "" for the whole.
    std::string place = {};
    std::string found = {};
    /// What would be right, where that can be said shortly.
    std::string expected = {};
    std::string hint = {};
    /// In the file that was read, from 1; 0: unknown.
    long line = 0;
    long column = 0;

    bool IsError() const { return code->severity == fnd_Severity::ERROR; }
    /// "found ..., expected ...; hint", or with the hint ahead of a long list.
    std::string Text() const;
};

inline fnd_Finding fnd_Make(fnd_CodeName code, std::string place, std::string found,
                            std::string expected = {}, std::string hint = {}) {
    return {&code.Row(), std::move(place), std::move(found), std::move(expected), std::move(hint)};
}

/// "error", "warning" or "note".
const char* fnd_SeverityWord(fnd_Severity severity);

/// Takes findings.
class fnd_Sink {
public:
    virtual ~fnd_Sink() = default;
    virtual void Take(fnd_Finding finding) = 0;
    /// Whether the next finding is worth a hint that has to be searched for. Of many errors of one kind the
    /// first few hints say it all.
    virtual bool WantsHint() { return hints_++ < kMostHints; }

    void Add(fnd_CodeName code, std::string place, std::string found, std::string expected = {},
             std::string hint = {}) {
        Take(fnd_Make(code, std::move(place), std::move(found), std::move(expected), std::move(hint)));
    }
    void Add(fnd_CodeName code, const fnd_Path& place, std::string found, std::string expected = {},
             std::string hint = {}) {
        Add(code, place.Text(), std::move(found), std::move(expected), std::move(hint));
    }

protected:
    static constexpr int kMostHints = 50;

private:
    int hints_ = 0;
};

/// Keeps them all.
class fnd_List final : public fnd_Sink {
public:
    void Take(fnd_Finding finding) override { findings.push_back(std::move(finding)); }
    std::vector<fnd_Finding> findings;
};

/// Raises at the first error and passes all else over; for programs that fill a store directly.
class fnd_Raise final : public fnd_Sink {
public:
    void Take(fnd_Finding finding) override;
};

/// Hands findings on, their places below a path.
class fnd_Below final : public fnd_Sink {
public:
    fnd_Below(fnd_Sink& sink, const fnd_Path& path) : sink_(sink), path_(path) {}
    void Take(fnd_Finding finding) override;
    bool WantsHint() override { return sink_.WantsHint(); }

private:
    fnd_Sink& sink_;
    const fnd_Path& path_;
};

#endif
