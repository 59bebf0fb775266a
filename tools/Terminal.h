#ifndef QRX_TOOLS_TERMINAL_H
#define QRX_TOOLS_TERMINAL_H

#include <cstddef>
#include <optional>
#include <string>

enum class ColourWhenEnm { AUTO, ALWAYS, NEVER };

/// "auto", "always" or "never".
std::optional<ColourWhenEnm> ColourWhenOf(const std::string& word);

enum class StreamEnm { OUTPUT, ERRORS };

/// Whether the stream shows on a terminal that moves its cursor.
bool IsLiveTerminal(StreamEnm stream);
/// With AUTO on terminals, unless the variable NO_COLOR is set to anything.
bool HasColours(StreamEnm stream, ColourWhenEnm when);
/// Columns of the terminal that the output shows on, from 40 to 100; 80 where it is none.
std::size_t TextWidth();

#endif
