#ifndef QRX_MODEL_FILE_MDF_PARSER_H
#define QRX_MODEL_FILE_MDF_PARSER_H

#include "model_file/mdf_Value.h"

#include <string>
#include <string_view>
#include <vector>

/// Something wrong in a model file. Errors of syntax have a line and a column, both counted from 1 (the
/// column in bytes, a byte order mark not counted); errors of content have a JSON pointer and line 0. An
/// empty pointer with line 0 is the whole document.
struct mdf_Error {
    std::string pointer;
    long line = 0;
    long column = 0;
    std::string text;

    /// "model.json:3:14: text" or "model.json: /models/A: text".
    std::string Message(std::string_view fileName) const;
};

/// Nesting of arrays and objects beyond this is an error.
inline constexpr int mdf_maxDepth = 200;
/// No more errors of content than this are reported for one document.
inline constexpr std::size_t mdf_maxErrors = 50;

/// Appends "/" and the token to a JSON pointer, with ~ and / in the token as ~0 and ~1.
void mdf_AppendPointer(std::string& pointer, std::string_view token);
void mdf_AppendPointer(std::string& pointer, std::size_t index);

/// Reads a JSON document (UTF-8, // and /* */ comments allowed) in one pass.
/// True when there was no error; errors are appended. After an error of syntax (always the last one) `root`
/// is Null; after errors of content it is the document, with the first of several members of one name.
bool mdf_Parse(std::string_view text, mdf_Value& root, std::vector<mdf_Error>& errors);

/// Reads a file into memory; false, with an error in the system's words, when it can't be read.
bool mdf_ReadFile(const std::string& path, std::string& text, mdf_Error& error);

#endif
