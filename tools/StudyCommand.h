#ifndef QRX_TOOLS_STUDYCOMMAND_H
#define QRX_TOOLS_STUDYCOMMAND_H

#include "study/sty_Study.h"
#include "tools/RunReport.h"

/// What the user asked for.
struct StudyCommand {
    sty_Request request;
    /// "K/N"; empty: all rows.
    std::string shard;
    /// The folder whose ledgers are to be joined; empty: none.
    std::string merge;
    /// "slurm" or "snakemake": a script for that scheduler; empty: none.
    std::string emit;
    /// Shards of the script.
    int shards = 0;
};

/// Writes the decks of a study, or joins its ledgers, or prints a script for a scheduler.
ExitCode RunStudy(const StudyCommand& command, RunReport& report);

#endif
