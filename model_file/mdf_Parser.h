#ifndef QRX_MODEL_FILE_MDF_PARSER_H
#define QRX_MODEL_FILE_MDF_PARSER_H

#include "model_file/mdf_Value.h"
#include "store_interface/findings/fnd_Finding.h"

#include <string>
#include <string_view>
#include <vector>

struct thr_Progress;

/// Nesting of arrays and objects beyond this is an error.
inline constexpr int mdf_maxDepth = 200;
/// No more errors of content than this are reported for one document.
inline constexpr std::size_t mdf_maxErrors = 50;

/// Reads a JSON document (UTF-8, // and /* */ comments allowed) in one pass.
/// True when there was no error; errors are appended, with line and column from 1 (the column in bytes, a
/// byte order mark not counted), those of content with a JSON pointer too. After an error of syntax (always
/// the last one) `root` is Null; after errors of content it is the document, with the first of several
/// members of one name.
bool mdf_Parse(std::string_view text, mdf_Value& root, std::vector<fnd_Finding>& errors,
               thr_Progress* progress = nullptr);

/// Reads a file into memory; false, with an error in the system's words, when it can't be read.
bool mdf_ReadFile(const std::string& path, std::string& text, fnd_Finding& error);

#endif
