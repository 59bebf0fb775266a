#ifndef QRX_OIF_COMMENT_H
#define QRX_OIF_COMMENT_H

#include "keyword_layer/qkw_Keyword.h"

/// A text as comment lines:
///     ** first piece
///     ** second piece
/// The pieces are those between newlines; an empty piece gives "** ", and so does what follows a newline at
/// the very end. An empty text writes nothing.
class oif_Comment final : public qkw_KeywordOf<oif_Comment> {
public:
    explicit oif_Comment(const cow_String& text) : text_(text) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String text_;
};

/// A text that goes out as it stands, its last line ended if it isn't. An empty text writes nothing.
class oif_RawKeyword final : public qkw_KeywordOf<oif_RawKeyword> {
public:
    explicit oif_RawKeyword(const cow_String& text) : text_(text) {}
    void Write(utl_Stream& stream) const override;
    bool IsEmpty() const override { return text_.IsEmpty(); }

private:
    cow_String text_;
};

/// The opening text of the deck: goes out as it stands, and nothing is added.
class oif_FileHeader final : public qkw_KeywordOf<oif_FileHeader> {
public:
    explicit oif_FileHeader(const cow_String& text) : text_(text) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String text_;
};

#endif
