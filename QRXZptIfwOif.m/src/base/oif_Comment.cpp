#include "base/oif_Comment.h"

void oif_Comment::Write(utl_Stream& stream) const {
    const int length = text_.Length();
    for (int position = 0; position < length;) {
        const int newline = text_.Find("\n", position);
        const int end = newline < 0 ? length : newline;
        // The blank stays also where nothing follows it.
        stream << "** ";
        if (end > position) stream << cow_String().Append(text_, position, end - position);
        stream << endl;
        position = end + 1;
        if (newline >= 0 && position == length) stream << "** " << endl;
    }
}

void oif_RawKeyword::Write(utl_Stream& stream) const {
    if (text_.IsEmpty()) return;
    stream << text_;
    if (text_.View().back() != '\n') stream << endl;
}

void oif_FileHeader::Write(utl_Stream& stream) const {
    // No line end is added: the text brings its own, or the deck goes on in its last line.
    if (!text_.IsEmpty()) stream << text_;
}
