#include "keyword_layer/qkw_QuorixName.h"

#include "foundation/omu_QuorixName.h"

cow_String qkw_QuorixName::Printable() const {
    return omu_QuorixName::QuoteIfNeeded(text_);
}

cow_String qkw_QuorixName::PrintableFileName() const {
    // A comma would need quotes too, but files have always been looked at for blanks alone.
    if (text_.Find(" ") < 0) return text_;
    return cow_String("\"") + text_ + "\"";
}

void qkw_QuorixName::SplitName(const cow_String& name, cow_String& prefix, cow_String& last) {
    if (name.IsEmpty()) return;
    const cow_List<cow_String> tokens = rgx_split(name, "[\\.]");
    if (tokens.IsEmpty()) return;
    last = tokens.Last();
    // The prefix is not cleared: callers may have begun it.
    for (int i = 0; i + 1 < tokens.Length(); ++i) prefix.Append(tokens[i]).Append(".");
}

utl_Stream& operator<<(utl_Stream& stream, const qkw_QuorixName& name) {
    stream.Print(name.IsFileName() ? name.PrintableFileName() : name.Printable());
    return stream;
}
