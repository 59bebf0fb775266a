#ifndef QRX_MODEL_FILE_MDF_POINTER_H
#define QRX_MODEL_FILE_MDF_POINTER_H

#include "model_file/mdf_Value.h"

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

// JSON pointers (RFC 6901) into the tree of a document.

/// The tokens of a pointer; nothing for a text that is none.
std::optional<std::vector<std::string>> mdf_PointerTokens(std::string_view pointer);
/// Whether there is a value at the end of the tokens.
bool mdf_HasPlace(const mdf_Value& root, std::span<const std::string> tokens);
/// The first token that leads nowhere, and the names that stand there instead; -1 when all lead on.
int mdf_FirstWrongToken(const mdf_Value& root, std::span<const std::string> tokens,
                        std::vector<std::string>* names = nullptr);
/// Puts a value in the place of one that is there.
void mdf_PutAt(mdf_Value& root, std::span<const std::string> tokens, const mdf_Value& value);
/// The value as JSON text on one line.
std::string mdf_JsonText(const mdf_Value& value);

#endif
