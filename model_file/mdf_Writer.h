#ifndef QRX_MODEL_FILE_MDF_WRITER_H
#define QRX_MODEL_FILE_MDF_WRITER_H

#include "model_file/mdf_Value.h"

#include <cstddef>
#include <cstdint>
#include <ostream>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// How the items of an array or object stand. Inside OneLine and Wrapped everything stays on the line.
enum class mdf_Layout : std::uint8_t {
    Lines,   ///< one item per line, indented
    OneLine, ///< all on the line where the container begins
    Wrapped, ///< as many items per line as fit; for long lists of numbers
};

/// Writes JSON text, call by call, whatever the locale. Calls that can't make a document (a value without a
/// key in an object, a key in an array, an end without a beginning, a second root) raise std::logic_error;
/// numbers that are not finite and strings that are not UTF-8 raise std::invalid_argument.
class mdf_Writer {
public:
    /// The stream must outlive the writer.
    explicit mdf_Writer(std::ostream& out) : out_(out) {}
    mdf_Writer(const mdf_Writer&) = delete;
    mdf_Writer& operator=(const mdf_Writer&) = delete;

    void BeginObject(mdf_Layout layout = mdf_Layout::Lines) { Begin('{', layout); }
    void Key(std::string_view name);
    void EndObject() { End('{'); }
    void BeginArray(mdf_Layout layout = mdf_Layout::Lines) { Begin('[', layout); }
    void EndArray() { End('['); }

    void Null();
    void Bool(bool value);
    void Int(int value);
    /// The shortest text that reads back as the same double, always with a fraction or an exponent.
    void Real(double value);
    /// The shortest text that a reader in double precision rounds to the same float.
    void Real(float value);
    void String(std::string_view value);
    /// A whole value; arrays of numbers are Wrapped, rows of a Matrix or FacetArray OneLine.
    void Value(const mdf_Value& value);

    /// An array on one line.
    void Row(std::span<const int> row);
    void Row(std::span<const double> row);
    void Row(std::span<const float> row);

    /// Ends the text with a newline and hands everything to the stream; to be called once, after the root's
    /// end. True when the stream took it all.
    bool Finish();

private:
    struct Level {
        char bracket;
        mdf_Layout layout;
        bool empty;
    };

    void Begin(char bracket, mdf_Layout layout);
    void End(char bracket);
    void Scalar(std::string_view text);
    void RealText(char* begin, char* end);
    void Separate(std::size_t length, bool isKey = false);
    void NewLine(std::size_t depth);
    void Quote(std::string_view text);
    void Flush();

    std::ostream& out_;
    std::string text_;
    std::size_t column_ = 0;
    std::vector<Level> levels_;
    bool keyed_ = false;
    bool done_ = false;
};

#endif
