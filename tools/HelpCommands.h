#ifndef QRX_TOOLS_HELPCOMMANDS_H
#define QRX_TOOLS_HELPCOMMANDS_H

#include "tools/OptionTree.h"
#include "tools/RunReport.h"

// Commands that tell of the program itself.

/// The help of the program, or of one of its verbs.
ExitCode RunHelp(const ProgramInfo& program, const std::string& verb, RunReport& report);
/// The manual page of the program, or of one of its verbs.
ExitCode RunManual(const ProgramInfo& program, const std::string& verb, RunReport& report);
/// Writes all manual pages into a folder that is there.
ExitCode WriteManuals(const ProgramInfo& program, const std::string& folder, RunReport& report);
ExitCode RunCompletion(const ProgramInfo& program, const std::string& shell, RunReport& report);
/// What findings mean, why they matter and how they are mended; without codes a list of all.
ExitCode RunExplain(const std::vector<std::string>& codes, RunReport& report);

/// All codes that findings are told with.
std::vector<std::string> CodesOfFindings();
/// "did you mean 'write'?", or what verbs there are.
std::string HintOfVerb(const ProgramInfo& program, const std::string& verb);

#endif
