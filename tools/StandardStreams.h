#ifndef QRX_TOOLS_STANDARDSTREAMS_H
#define QRX_TOOLS_STANDARDSTREAMS_H

#include <string>
#include <string_view>

// The three streams that a program is started with, below the buffers of the standard library.

/// Opens those that are closed on nothing, so that no file gets their numbers; what is written to the
/// standard output or read from the standard input fails all the same.
void SecureStandardStreams() noexcept;
/// Whether anything can be written to the standard output at all.
bool CanWriteToStandardOutput() noexcept;
/// Writes all of the text; the errno value of the failure, 0 for none.
int WriteToStandardOutput(std::string_view text) noexcept;
int WriteToStandardError(std::string_view text) noexcept;
/// Reads the standard input to its end; the errno value of the failure, 0 for none.
int ReadStandardInput(std::string& text);
/// The width of the terminal that the standard output, or the standard error, shows on; 0 where it doesn't
/// tell, -1 where it is no terminal.
int ColumnsOfTerminal(bool ofErrors) noexcept;

#endif
