#include "materials/oif_OptionLine.h"

oif_OptionLine::oif_OptionLine(utl_Stream& stream, const char* keyword) : stream_(stream) {
    stream_ << keyword;
}

oif_OptionLine& oif_OptionLine::Separator() {
    stream_ << ", ";
    stream_.OptionalLineBreak();
    return *this;
}

oif_OptionLine& oif_OptionLine::Text(const char* text) {
    stream_ << text;
    return *this;
}

oif_OptionLine& oif_OptionLine::Text(const cow_String& text) {
    stream_ << text;
    return *this;
}

oif_OptionLine& oif_OptionLine::Word(const char* word) {
    return Separator().Text(word);
}

oif_OptionLine& oif_OptionLine::WordIf(bool condition, const char* word) {
    return condition ? Word(word) : *this;
}

oif_OptionLine& oif_OptionLine::Value(const char* name, int value) {
    Word(name);
    stream_ << value;
    return *this;
}

oif_OptionLine& oif_OptionLine::Value(const char* name, double value) {
    Word(name);
    stream_ << value;
    return *this;
}

oif_OptionLine& oif_OptionLine::Dependencies(int count) {
    return count > 0 ? Value("dependencies=", count) : *this;
}

oif_OptionLine& oif_OptionLine::Direction(int type) {
    return WordIf(type == 1, "type=ORTHO").WordIf(type == 2, "type=ANISO");
}

oif_OptionLine& oif_OptionLine::Moduli(bool longTerm) {
    return Word(longTerm ? "moduli=LONG TERM" : "moduli=INSTANTANEOUS");
}

void oif_OptionLine::End() {
    stream_.LineBreak();
}
