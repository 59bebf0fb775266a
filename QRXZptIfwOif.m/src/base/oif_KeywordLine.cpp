#include "base/oif_KeywordLine.h"

oif_KeywordLine::oif_KeywordLine(utl_Stream& stream, const char* keyword) : stream_(stream) {
    stream_ << keyword;
}

oif_KeywordLine& oif_KeywordLine::Separator() {
    stream_ << ", ";
    stream_.OptionalLineBreak();
    return *this;
}

oif_KeywordLine& oif_KeywordLine::Text(const char* text) {
    stream_ << text;
    return *this;
}

oif_KeywordLine& oif_KeywordLine::Text(const cow_String& text) {
    stream_ << text;
    return *this;
}

oif_KeywordLine& oif_KeywordLine::Text(const qkw_QuorixName& name) {
    stream_ << name;
    return *this;
}

oif_KeywordLine& oif_KeywordLine::Text(int value) {
    stream_ << value;
    return *this;
}

oif_KeywordLine& oif_KeywordLine::Text(double value) {
    stream_ << value;
    return *this;
}
