#ifndef QRX_TOOLS_PROGRAM_H
#define QRX_TOOLS_PROGRAM_H

/// Runs the command line in this process, which is the program's alone: signals, standard streams and a lack
/// of memory are the program's too. Gives its exit code.
int RunProgram(int argc, char** argv);

/// "qrxdeck 1.0.0 (0123456789ab)": the commit where it is known, with "+" when the sources were changed
/// since.
const char* ProgramVersion() noexcept;

#endif
