#ifndef QRX_STORE_FND_CODES_H
#define QRX_STORE_FND_CODES_H

#include <cstddef>
#include <string_view>

enum class fnd_Severity {
    ERROR,   ///< the model is refused
    WARNING, ///< a deck can be written, and is hardly what was meant
    NOTE,    ///< something that the deck leaves out or that is worth a look
};

/// A kind of finding under its short name, which never changes: tools and people refer to it.
struct fnd_Code {
    std::string_view name;
    fnd_Severity severity;
    /// What it means, for the documentation.
    const char* meaning;
};

/// All kinds of findings there are.
inline constexpr fnd_Code fnd_Codes[] = {
#include "store_interface/findings/fnd_Codes.inl"
};

/// The name of a code, looked up while compiling: a name that no row has does not compile.
class fnd_CodeName {
public:
    // NOLINTNEXTLINE(google-explicit-constructor): a literal in a call is the name
    consteval fnd_CodeName(const char* name) : row_(&Find(name)) {}
    constexpr const fnd_Code& Row() const { return *row_; }

private:
    static consteval const fnd_Code& Find(std::string_view name) {
        for (const fnd_Code& code : fnd_Codes) {
            if (code.name == name) return code;
        }
        throw "no such code";
    }

    const fnd_Code* row_;
};

#endif
