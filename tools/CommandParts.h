#ifndef QRX_TOOLS_COMMANDPARTS_H
#define QRX_TOOLS_COMMANDPARTS_H

#include "tools/RunReport.h"
#include "whole_file/whf_File.h"

#include <list>
#include <memory>

// What commands are put together from.

/// Stands for the standard input, or output, where a file may be named.
inline constexpr char kStandardStream[] = "-";
/// What messages call an input.
std::string InputName(const std::string& path);
/// Reads the text of a file or of the standard input; false, with an error in the system's words.
bool ReadInput(const std::string& path, std::string& text, fnd_Finding& error);
/// Reads a model file, or a model from the standard input, with all that is to be said of it.
std::unique_ptr<odb_Odb> ReadModelInput(const std::string& path, mdf_Report& found,
                                        const mdf_ModelChoice& choice = {});
/// The store of a model file that is right; else null, with the code.
std::unique_ptr<odb_Odb> ReadModel(const std::string& path, RunReport& report, ExitCode& code,
                                   std::list<mdf_MeshOrigin>* origins = nullptr,
                                   const mdf_ModelChoice& choice = {});
/// Replaces the file as a whole; false, with the reason, when the file system refuses. `tell` prints what
/// there is to say of it, for which everything that can fail is done before the file stands. What `write`
/// raises beyond that comes through.
bool ReplaceFile(whf_File& file, const whf_File::Write& write, const whf_File::Ready& tell,
                 RunReport& report);
/// Replaces the file as a whole by what `write` gives, or leaves it as it was; false when the file system
/// refuses. Messages call the file by the word `thing`.
bool ReplaceFile(const std::string& target, const char* thing, const std::function<void(qio_ostream&)>& write,
                 RunReport& report);
/// The same for a text.
ExitCode WriteWholeFile(const std::string& path, const char* thing, const std::string& text,
                        RunReport& report);

#endif
