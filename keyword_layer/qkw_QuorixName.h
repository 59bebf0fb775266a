#ifndef QRX_KEYWORD_QKW_QUORIXNAME_H
#define QRX_KEYWORD_QKW_QUORIXNAME_H

#include "foundation/utl_Stream.h"

/// A name on its way to the deck: of an object, or of a file.
class qkw_QuorixName {
public:
    qkw_QuorixName(const cow_String& text, bool isFileName) : text_(text), isFileName_(isFileName) {}

    /// The name as one word of the deck: bare, or in double quotes when it needs them. A name in quotes, and
    /// a dotted name of plain parts, stay as they are.
    cow_String Printable() const;
    /// A file's name: in double quotes if it has a blank in it. Only blanks are looked at.
    cow_String PrintableFileName() const;
    bool IsFileName() const { return isFileName_; }

    /// Splits at the last dot: `last` becomes the piece behind it, the pieces before it are appended to
    /// `prefix`, each with its dot. An empty name leaves both alone.
    static void SplitName(const cow_String& name, cow_String& prefix, cow_String& last);

private:
    cow_String text_;
    bool isFileName_;
};

utl_Stream& operator<<(utl_Stream& stream, const qkw_QuorixName& name);

#endif
