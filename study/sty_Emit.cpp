#include "study/sty_Json.h"
#include "study/sty_Study.h"

#include <algorithm>

namespace {

/// For a POSIX shell.
std::string ShellQuoted(const std::string& text) {
    std::string quoted = "'";
    for (const char c : text) quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
    return quoted + "'";
}

void ReplaceAll(std::string& text, std::string_view word, const std::string& by) {
    for (std::size_t at = text.find(word); at != std::string::npos; at = text.find(word, at + by.size()))
        text.replace(at, word.size(), by);
}

/// Python takes JSON strings, but within a Snakefile braces are formatted only where a rule says so.
std::string Filled(std::string text, const sty_Request& request, const std::string& program,
                   std::string (*quote)(const std::string&)) {
    ReplaceAll(text, "@PROGRAM@", quote(program));
    ReplaceAll(text, "@TEMPLATE@", quote(request.model));
    ReplaceAll(text, "@TABLE@", quote(request.table));
    ReplaceAll(text, "@MODEL@", quote(request.modelName));
    ReplaceAll(text, "@OUT@", quote(request.out));
    ReplaceAll(text, "@SHARDS@", std::to_string(request.shards));
    ReplaceAll(text, "@JOBS@", std::to_string(std::max(request.jobs, 1)));
    return text;
}

constexpr const char* kSlurm = R"(#!/bin/bash
#SBATCH --array=1-@SHARDS@
#SBATCH --signal=B:TERM@60
#SBATCH --open-mode=append
# A study in @SHARDS@ shards, each a task of an array. "bash job.sh" submits the array with what is set here, and behind
# it a job that joins the ledgers; "sbatch job.sh" submits the array alone. Submitted again, it does what is missing
# or failed.

# What the cluster wants to know of a task; empty: the cluster's own default.
account=
partition=
time=01:00:00
memory=2G
cpus=@JOBS@
# Tasks at a time; empty: as many as there are.
at_once=

program=@PROGRAM@
template=@TEMPLATE@
table=@TABLE@
# One of the template's models; empty: the only one, or "Default Model".
model=@MODEL@
out=@OUT@

if [ -z "${SLURM_ARRAY_TASK_ID-}" ]; then
    ask=(${account:+--account="$account"} ${partition:+--partition="$partition"} ${time:+--time="$time"})
    each=(${memory:+--mem="$memory"} ${cpus:+--cpus-per-task="$cpus"})
    array=$(sbatch --parsable "${ask[@]}" "${each[@]}" --array="1-@SHARDS@${at_once:+%$at_once}" "$0") || exit
    echo "array job ${array%%;*}"
    printf '#!/bin/bash\nexec %q study --merge %q\n' "$program" "$out" |
        sbatch "${ask[@]}" --dependency="afterany:${array%%;*}" --job-name=merge
    exit
fi

# The shell gives its place to the program, which the signal ahead of the time limit then reaches.
exec "$program" study "$template" "$table" --out "$out" ${model:+--model="$model"} \
    --shard "$SLURM_ARRAY_TASK_ID/@SHARDS@" --jobs "${SLURM_CPUS_PER_TASK:-1}" --resume
)";

constexpr const char* kSnakemake =
    R"(# A study in @SHARDS@ shards. A shard whose rows are all taken up is done, also where some of them failed; joining the
# ledgers then ends with an error that names these.
PROGRAM = @PROGRAM@
TEMPLATE = @TEMPLATE@
TABLE = @TABLE@
# One of the template's models; empty: the only one, or "Default Model".
MODEL = @MODEL@
OUT = @OUT@
SHARDS = @SHARDS@
JOBS = @JOBS@

# What a cluster wants to know of a shard.
ACCOUNT = ""
MINUTES = 60
MEMORY_MB = 2000

# No ledger is an output: Snakemake removes the outputs of what failed.
MARK = OUT.replace("{", "{{").replace("}", "}}") + "/.study/snakemake/"


rule all:
    input:
        MARK + "merged",


rule merge:
    input:
        expand(MARK + "{shard}", shard=range(1, SHARDS + 1)),
    output:
        touch(MARK + "merged"),
    params:
        program=PROGRAM,
        out=OUT,
    shell:
        "{params.program:q} study --merge {params.out:q}"


rule shard:
    output:
        touch(MARK + "{shard,[0-9]+}"),
    params:
        program=PROGRAM,
        template=TEMPLATE,
        table=TABLE,
        model=["--model=" + MODEL] if MODEL else [],
        out=OUT,
        shards=SHARDS,
    threads: JOBS
    resources:
        runtime=MINUTES,
        mem_mb=MEMORY_MB,
        slurm_account=ACCOUNT,
    shell:
        "{params.program:q} study {params.template:q} {params.table:q} {params.model:q} --out {params.out:q}"
        " --shard {wildcards.shard}/{params.shards} --jobs {threads} --resume || [ $? -eq 1 ]"
)";

} // namespace

std::string sty_SlurmScript(const sty_Request& request, const std::string& program) {
    return Filled(kSlurm, request, program, ShellQuoted);
}

std::string sty_Snakefile(const sty_Request& request, const std::string& program) {
    return Filled(kSnakemake, request, program, [](const std::string& text) { return sty_Quoted(text); });
}
