#include "tools/CommandLine.h"

#include "foundation/thr_InOrder.h"
#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "tools/CommandParts.h"
#include "tools/OutOfMemory.h"
#include "tools/Program.h"
#include "tools/VariableList.h"

#include <algorithm>
#include <map>

namespace {

constexpr char kProgram[] = "qrxdeck";
constexpr char kAbout[] =
    "Writes finite-element models, held in JSON model files, as keyword decks; checks and compares decks.";

const std::vector<std::pair<int, std::string>> kExitCodes = {
    {0, "done (there may be warnings)"},
    {1, "the model is wrong, or not in canonical form (format --check)"},
    {2, "wrong usage"},
    {3, "a file can't be read or written, or there is not enough memory"},
    {4, "a deck can't express the model: the reason on a line, object and step on the next"},
    {5, "an internal failure"},
    {6, "the file was written, but the report on it is lost"},
};

const std::vector<std::string> kModels = {"json"};
const std::vector<std::string> kModelsAndDecks = {"json", "inp"};
const std::vector<std::string> kMeshes = {"msh", "unv", "med", "vtu", "vtk", "stl"};

/// The worse of two: a lost report is the least of failures.
ExitCode Worse(ExitCode a, ExitCode b) {
    const auto rank = [](ExitCode code) {
        if (code == ExitCode::DONE) return -1;
        return code == ExitCode::REPORT_LOST ? 0 : static_cast<int>(code);
    };
    return rank(b) > rank(a) ? b : a;
}

std::vector<std::string> SplitAtCommas(const std::string& text) {
    std::vector<std::string> words;
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t end = std::min(text.find(", ", at), text.size());
        words.push_back(text.substr(at, end - at));
        at = end + 2;
    }
    return words;
}

} // namespace

CommandLine::CommandLine() : app_(kAbout, kProgram) {
    app_.set_version_flag("--version", ProgramVersion(), "Print the version");
    app_.set_help_flag("-h,--help", "Print this help");
    app_.require_subcommand(1);
    // Options of the program may stand behind the command too.
    app_.fallthrough();
    Take(app_.add_option(
                 "--color", colour_,
                 "Colours of messages: on terminals (auto, where NO_COLOR isn't set), always, or never")
             ->type_name("WHEN")
             ->check(CLI::IsMember({"auto", "always", "never"})),
         Values::WORDS, {"auto", "always", "never"});
    AddWrite();
    AddCheck();
    AddDiff();
    AddFlatten();
    AddInfo();
    AddMesh();
    AddNew();
    AddFormat();
    AddStudy();
    AddView();
    AddTables();
    AddAboutItself();
    Describe();
}

ReportOptions CommandLine::Options() const {
    ReportOptions options;
    options.json = json_;
    options.colour = *ColourWhenOf(colour_);
    options.all = all_;
    options.strict = strict_;
    options.ignored = ignored_;
    options.progress = true;
    return options;
}

std::string CommandLine::Complaint(const CLI::ParseError& error,
                                   const std::vector<std::string>& words) const {
    if (words.empty()) return "no command is given";
    const std::vector<CLI::App*> commands = app_.get_subcommands();
    if (commands.empty() && words.front().front() != '-') {
        return "there is no command " + fnd_Quoted(words.front()) + "; " + HintOfVerb(info_, words.front());
    }
    const std::string text = error.what();
    if (commands.empty() || dynamic_cast<const CLI::ExtrasError*>(&error) == nullptr) return text;
    const auto wrong = std::ranges::find_if(words, [&text](const std::string& word) {
        return word.starts_with("--") && text.find(word) != std::string::npos;
    });
    if (wrong == words.end()) return text;
    std::vector<std::string> names;
    for (const auto* options : {&info_.Find(commands.front()->get_name())->options, &info_.options}) {
        for (const OptionInfo& option : *options)
            names.insert(names.end(), option.names.begin(), option.names.end());
    }
    const std::string option = wrong->substr(0, wrong->find('='));
    const std::string hint = fnd_DidYouMean(option, names);
    return "the command " + commands.front()->get_name() + " has no option " + fnd_Quoted(option) +
           (hint.empty() ? "" : "; " + hint);
}

std::string CommandLine::Help() const {
    const std::vector<CLI::App*> commands = app_.get_subcommands();
    if (commands.empty()) return HelpOf(info_, TextWidth());
    return HelpOf(info_, *info_.Find(commands.front()->get_name()), TextWidth());
}

ExitCode CommandLine::Run(RunReport& report) {
    thr_SetUsualThreads(threads_);
    for (const std::string& code : ignored_) {
        const std::vector<std::string> codes = CodesOfFindings();
        if (std::ranges::find(codes, code) != codes.end()) continue;
        const std::string hint = fnd_DidYouMean(code, codes);
        report.Error(kProgram, "there is no finding " + fnd_Quoted(code) + " to ignore; " +
                                   (hint.empty() ? "\"qrxdeck explain\" lists them" : hint));
        return ExitCode::WRONG_USAGE;
    }
    const auto verb = std::ranges::find_if(verbs_, [](const Verb& each) { return each.command->parsed(); });
    return verb->run(report);
}

CommandLine::Verb& CommandLine::AddVerb(const char* name, const char* about,
                                        std::function<ExitCode(RunReport& report)> run) {
    return verbs_.emplace_back(Verb{app_.add_subcommand(name, about), std::move(run), {}, {}, {}});
}

CLI::Option* CommandLine::Take(CLI::Option* option, Values kind, std::vector<std::string> words) {
    values_[option] = {kind, std::move(words)};
    return option;
}

void CommandLine::AddInput(CLI::App* command, std::string& file, const char* about,
                           const std::vector<std::string>& extensions) {
    Take(command->add_option("MODEL", file, about)->required(), Values::FILES, extensions);
    AddThreads(command);
    AddJson(command);
}

void CommandLine::AddInputs(CLI::App* command, const char* about,
                            const std::vector<std::string>& extensions) {
    Take(command->add_option("MODEL", inputs_, about)->required(), Values::FILES, extensions);
    command->add_flag("--fail-fast", failFast_, "Of several, go no further than the first that fails");
    AddThreads(command);
    AddJson(command);
}

CLI::Option* CommandLine::AddOutput(CLI::App* command, std::string& file, const char* about) {
    return Take(command->add_option("-o,--output", file, about)->type_name("FILE"), Values::FILES);
}

void CommandLine::AddThreads(CLI::App* command) {
    command
        ->add_option("--threads", threads_,
                     "Threads for what is large, 1 to 64; the result is the same with any number (default: "
                     "one a core)")
        ->check(CLI::Range(1, 64))
        ->type_name("N");
}

void CommandLine::AddJson(CLI::App* command) {
    command->add_flag("--json", json_,
                      "Everything as one JSON object on the standard output: exitCode, messages, results; of "
                      "several files an object each, in \"runs\"");
}

void CommandLine::AddStrictness(CLI::App* command) {
    command->add_flag("--strict", strict_, "Warnings are errors");
    Take(command
             ->add_option("--ignore", ignored_,
                          "Say nothing of warnings and notes with the code; may be given several times")
             ->type_name("CODE")
             ->allow_extra_args(false),
         Values::WORDS, CodesOfFindings());
    command->add_flag("--all", all_, "All messages, not the first fifty of a kind");
}

ExitCode CommandLine::RunEach(const RunOne& run, RunReport& report) const {
    if (inputs_.size() == 1) return run(inputs_.front(), report);
    ExitCode worst = ExitCode::DONE;
    for (const std::string& input : inputs_) {
        report.BeginRun(InputName(input));
        OutOfMemory::MarkWritten(false);
        const ExitCode code = run(input, report);
        report.EndRun(code);
        worst = Worse(worst, code);
        if (failFast_ && code != ExitCode::DONE) break;
    }
    return worst;
}

ExitCode CommandLine::RunWriteEach(RunReport& report) const {
    const auto requestOf = [this](const std::string& input) {
        WriteRequest request = write_;
        request.model = input;
        return request;
    };
    const bool several = inputs_.size() > 1;
    if (several && !(write_.job.empty() && write_.output.empty())) {
        report.Error(kProgram, "several models can't become one deck: --job and -o take one model");
        return ExitCode::WRONG_USAGE;
    }
    std::map<std::string, std::string> modelOfDeck;
    for (const std::string& input : inputs_) {
        const std::string target = DeckTargetOf(requestOf(input));
        const auto [place, isNew] = modelOfDeck.emplace(target, input);
        if (isNew) continue;
        report.Error(kProgram, "the models " + fnd_Quoted(place->second) + " and " + fnd_Quoted(input) +
                                   " would have one deck, " + fnd_Quoted(target));
        return ExitCode::WRONG_USAGE;
    }
    return RunEach([&](const std::string& input, RunReport& one) { return RunWrite(requestOf(input), one); },
                   report);
}

void CommandLine::AddModelName(CLI::App* command, std::string& name) {
    command
        ->add_option("--model", name,
                     "Which model of the file (default: the only one, or of several \"Default Model\")")
        ->type_name("NAME");
}

void CommandLine::AddWrite() {
    Verb& verb = AddVerb("write", "Write the deck of a model",
                         [this](RunReport& report) { return RunWriteEach(report); });
    AddInputs(verb.command, "Model files, JSON; \"-\" is the standard input", kModels);
    AddModelName(verb.command, write_.modelName);
    CLI::Option* job =
        verb.command
            ->add_option("--job", write_.job,
                         "Name of the deck, with \".inp\" or without; may hold a folder, relative to the "
                         "output folder, out of which \"../\" leads; \"-\" is the standard output (default: "
                         "the model file's name without extension)")
            ->type_name("NAME");
    CLI::Option* folder = Take(
        verb.command
            ->add_option("--output-dir", write_.outputDir, "Folder of the deck (default: the current one)")
            ->type_name("DIR"),
        Values::FOLDERS);
    AddOutput(verb.command, write_.output, "File of the deck as it stands; \"-\" is the standard output")
        ->excludes(job)
        ->excludes(folder);
    verb.command->add_flag(
        "--verify", write_.verify,
        "Read the deck back and hold it against the model: nodes, elements, sets, surfaces, "
        "materials, amplitudes, steps");
    AddStrictness(verb.command);
    verb.more = {"A run that fails leaves an older deck as it was. A deck takes over the access rights of "
                 "the one that it "
                 "replaces, which must be writable; a link is followed, other hard links keep the old deck.",
                 "Of several models each has its own deck; the exit code is that of the worst."};
    verb.examples = {{"qrxdeck write bridge.json", "writes bridge.inp into the current folder"},
                     {"qrxdeck write bridge.json frame.json --output-dir decks --strict",
                      "writes two decks, or none of a model with warnings"},
                     {"qrxdeck write - -o - < bridge.json > bridge.inp", "reads and writes streams"}};
}

void CommandLine::AddCheck() {
    Verb& verb = AddVerb(
        "check", "Look for errors in a model and what its deck can't say, or in a deck; write nothing",
        [this](RunReport& report) {
            return RunEach(
                [this](const std::string& input, RunReport& one) {
                    return IsDeck(input) ? RunCheckDeck(input, deck_, one) : RunCheck(input, modelName_, one);
                },
                report);
        });
    AddInputs(verb.command, "Model files, JSON, or decks, .inp; \"-\" is a model on the standard input",
              kModelsAndDecks);
    AddModelName(verb.command, modelName_);
    verb.command->add_flag("--no-includes", deck_.keepIncludesShut,
                           "Of a deck: don't read the files that it includes");
    AddStrictness(verb.command);
    verb.more = {
        "Each message ends with its code; \"qrxdeck explain CODE\" tells what it means and how it is "
        "mended. What is meant to be as it is can be listed in the member \"ignore\" of the model, each "
        "entry with a code and a reason."};
    verb.examples = {{"qrxdeck check bridge.json", ""},
                     {"qrxdeck check bridge.json bridge.inp --strict --ignore unused-nodes",
                      "fails for any warning but one"}};
}

void CommandLine::AddDiff() {
    Verb& verb =
        AddVerb("diff", "Compare two decks, or models, by what they mean", [this](RunReport& report) {
            return static_cast<ExitCode>(textOfDeck_ ? RunTextOfDeck(diff_.first, diff_.deck, report)
                                                     : RunDiff(diff_, report));
        });
    CLI::App* command = verb.command;
    Take(command->add_option("A", diff_.first, "Deck, .inp, or model file")->required(), Values::FILES,
         kModelsAndDecks);
    CLI::Option* second = Take(command->add_option("B", diff_.second, "Deck, .inp, or model file"),
                               Values::FILES, kModelsAndDecks);
    command
        ->add_flag("--textconv", textOfDeck_,
                   "Compare nothing: print A in one form, for programs that compare lines")
        ->excludes(second);
    command
        ->add_option("--tolerance", diff_.tolerance,
                     "Numbers are equal that differ by no more than this part of the greater")
        ->type_name("R");
    Take(command
             ->add_option(
                 "--ignore", diff_.ignore,
                 "What makes no difference: comments, names, order, titles, output, with commas between")
             ->type_name("WORDS"),
         Values::WORDS, {"comments", "names", "order", "titles", "output"});
    command->add_flag("--no-includes", diff_.deck.keepIncludesShut,
                      "Don't read the files that the decks include");
    AddJson(command);
    verb.exitCodes = {{0, "equal"}, {1, "different"}, {2, "an error"}};
    verb.examples = {{"qrxdeck diff bridge.json bridge.inp", ""},
                     {"qrxdeck diff old.inp bridge.inp --ignore comments,titles --tolerance 1e-6", ""}};
}

void CommandLine::AddFlatten() {
    Verb& verb = AddVerb("flatten", "Write a deck without parts, instances and assembly",
                         [this](RunReport& report) { return RunFlatten(flatten_, report); });
    Take(verb.command->add_option("FILE", flatten_.input, "Deck, .inp, or model file")->required(),
         Values::FILES, kModelsAndDecks);
    AddOutput(verb.command, flatten_.output, "Deck to write (default: the standard output)");
    verb.command->add_flag("--no-includes", flatten_.deck.keepIncludesShut,
                           "Don't read the files that the deck includes");
    AddJson(verb.command);
    verb.examples = {{"qrxdeck flatten bridge.inp -o flat.inp", ""}};
}

void CommandLine::AddInfo() {
    Verb& verb = AddVerb("info", "Tell what is in a model", [this](RunReport& report) {
        return RunEach(
            [this](const std::string& input, RunReport& one) { return RunInfo(input, history_, one); },
            report);
    });
    AddInputs(verb.command, "Model files, JSON; \"-\" is the standard input", kModels);
    verb.command->add_flag("--history", history_,
                           "Also what conditions, loads, interactions and output requests are in each step, "
                           "and what the step writes of them");
    verb.examples = {{"qrxdeck info bridge.json --history", ""}};
}

void CommandLine::AddMesh() {
    Verb& verb = AddVerb("mesh", "Tell of a mesher's file: cells, groups, quality",
                         [this](RunReport& report) { return RunMesh(mesh_, report); });
    Take(
        verb.command->add_option("MESH", mesh_.mesh, "Mesh file: MSH, UNV, MED, VTU, VTK or STL")->required(),
        Values::FILES, kMeshes);
    verb.command
        ->add_option("--group-arrays", mesh_.groupArrays,
                     "Arrays of cells that are to become groups, of formats that have none (VTK, VTU)")
        ->type_name("NAME");
    verb.command->add_option("--part", mesh_.part, "The mesh to take of a file with several")
        ->type_name("NAME");
    AddJson(verb.command);
    verb.examples = {{"qrxdeck mesh plate.msh", ""}};
}

void CommandLine::AddNew() {
    Verb& verb = AddVerb("new", "Make a model file for a mesher's file, to go on from",
                         [this](RunReport& report) { return RunNew(new_, report); });
    Take(verb.command->add_option("MESH", new_.mesh, "Mesh file: MSH, UNV, MED, VTU, VTK or STL")->required(),
         Values::FILES, kMeshes);
    AddOutput(verb.command, new_.output,
              "Model file to write (default: the mesh file's name with \".json\", in the current folder)");
    verb.command->add_flag("--force", new_.force, "Overwrite the file if it is there");
    AddJson(verb.command);
    verb.examples = {{"qrxdeck new plate.msh", "makes plate.json"}};
}

void CommandLine::AddFormat() {
    Verb& verb =
        AddVerb("format", "Write a model file anew in its canonical form", [this](RunReport& report) {
            if (inputs_.size() > 1 && !format_.check) {
                report.Error(kProgram, "several models are formatted one by one; --check takes them all");
                return ExitCode::WRONG_USAGE;
            }
            return RunEach(
                [this](const std::string& input, RunReport& one) {
                    FormatRequest request = format_;
                    request.model = input;
                    return RunFormat(request, one);
                },
                report);
        });
    AddInputs(verb.command, "Model file, JSON, or several to check; \"-\" is the standard input", kModels);
    CLI::Option* output = AddOutput(
        verb.command, format_.output,
        "File to write, which may be MODEL itself (default: the standard output); comments are left "
        "out, and on failure the old file stays as it was");
    verb.command
        ->add_flag("--check", format_.check,
                   "Write nothing; exit with 1 and name the file when it isn't in that form")
        ->excludes(output);
    verb.examples = {
        {"qrxdeck format bridge.json -o bridge.json", ""},
        {"qrxdeck format --check bridge.json frame.json", "for hooks that look ahead of a commit"}};
}

void CommandLine::AddStudy() {
    Verb& verb = AddVerb("study", "Write a deck for each row of a table of parameters",
                         [this](RunReport& report) { return RunStudy(study_, report); });
    CLI::App* command = verb.command;
    Take(command->add_option("TEMPLATE", study_.request.model, "Model file, JSON"), Values::FILES, kModels);
    Take(command->add_option("TABLE", study_.request.table,
                             "Table: .csv, .tsv, or .jsonl; columns are JSON pointers into the template, its "
                             "parameters, or \"name\""),
         Values::FILES, {"csv", "tsv", "jsonl"});
    AddModelName(command, study_.request.modelName);
    Take(command
             ->add_option("--out", study_.request.out,
                          "Folder of the decks and the ledger (default: the table's name without extension)")
             ->type_name("DIR"),
         Values::FOLDERS);
    command->add_option("--jobs", study_.request.jobs, "Decks at a time (default: as many as processors)")
        ->type_name("N");
    command->add_option("--shard", study_.shard, "Only the K-th of N parts of the rows")->type_name("K/N");
    command->add_flag("--resume", study_.request.resume, "Do what is missing or failed");
    command->add_flag("--dry-run", study_.request.dryRun, "Make all decks and write nothing");
    Take(command->add_option("--merge", study_.merge, "Join the ledgers of a study's shards")
             ->type_name("DIR"),
         Values::FOLDERS);
    Take(command->add_option("--emit", study_.emit, "Print a script that runs shards: for slurm or snakemake")
             ->type_name("WORD"),
         Values::WORDS, {"slurm", "snakemake"});
    command->add_option("--shards", study_.shards, "Shards of the script")->type_name("N");
    AddJson(command);
    verb.more = {"A run that a signal interrupts ends by that signal, when the rows in hand are done."};
    verb.exitCodes = {{0, "all rows have their decks"},
                      {1, "some failed"},
                      {2, "template, table or folder can't be used"},
                      {3, "a file can't be read or written"}};
    verb.examples = {{"qrxdeck study bridge.json loads.csv --out decks", "writes a deck a row"}};
}

void CommandLine::AddView() {
    Verb& verb = AddVerb("view", "Write a page that shows a model, step by step",
                         [this](RunReport& report) { return RunView(view_, report); });
    std::vector<std::string> extensions = kModelsAndDecks;
    extensions.insert(extensions.end(), kMeshes.begin(), kMeshes.end());
    AddInput(verb.command, view_.model, "Model file, JSON; a mesher's file; or a deck, .inp", extensions);
    AddModelName(verb.command, view_.modelName);
    AddOutput(verb.command, view_.output,
              "The page (default: the model file's name with .html, in the current folder)");
    Take(verb.command
             ->add_option("--vtu", view_.vtu,
                          "Also write the mesh with sections, materials and sets as a VTU file")
             ->type_name("FILE"),
         Values::FILES, {"vtu"});
    verb.command->add_flag("--open", view_.open, "Show the page in the browser");
    verb.examples = {{"qrxdeck view bridge.json -o bridge.html", ""}};
}

void CommandLine::AddTables() {
    Verb& variables = AddVerb("variables", "List the variables that output requests can ask for",
                              [this](RunReport& report) { return RunVariables(stepType_, report); });
    Take(variables.command
             ->add_option("--step-type", stepType_,
                          "Only those of one procedure, by the class of its step, such as StaticStep")
             ->type_name("TYPE"),
         Values::WORDS, SplitAtCommas(StepTypeNames()));
    AddJson(variables.command);
    variables.examples = {{"qrxdeck variables --step-type StaticStep", ""}};

    Verb& classes = AddVerb("classes", "List the classes of objects that model files know",
                            [this](RunReport& report) { return RunClasses(classFamily_, report); });
    Take(classes.command->add_option("FAMILY", classFamily_,
                                     "One family alone, such as steps, loads, sections, materials"),
         Values::WORDS, ClassFamilies());
    AddJson(classes.command);
    classes.examples = {{"qrxdeck classes loads", ""}};

    Verb& schema = AddVerb("schema", "Print the JSON Schema of model files, or one class as a table",
                           [this](RunReport& report) {
                               return schemaClass_.empty() ? RunSchema(schemaOutput_, report)
                                                           : RunSchemaOf(schemaClass_, report);
                           });
    CLI::Option* named = Take(schema.command->add_option("CLASS", schemaClass_,
                                                         "A class, or a part of a model such as instance, to "
                                                         "be read as a table"),
                              Values::WORDS, ClassNames());
    AddOutput(schema.command, schemaOutput_, "File to write (default: the standard output)")->excludes(named);
    AddJson(schema.command);
    schema.examples = {{"qrxdeck schema -o model.schema.json", "for editors and generators"},
                       {"qrxdeck schema StaticStep", "members, units, defaults, an example"}};
}

void CommandLine::AddAboutItself() {
    Verb& explain = AddVerb("explain", "Tell what a finding means, why it matters and how it is mended",
                            [this](RunReport& report) { return RunExplain(codes_, report); });
    Take(explain.command->add_option("CODE", codes_, "Codes, as messages end with them (default: list all)"),
         Values::WORDS, CodesOfFindings());
    AddJson(explain.command);
    explain.examples = {{"qrxdeck explain unused-nodes", ""}};

    Verb& help = AddVerb("help", "Tell of the commands, or more of one",
                         [this](RunReport& report) { return RunHelp(info_, word_, report); });
    CLI::Option* helpVerb = help.command->add_option("COMMAND", word_, "The command to tell of");
    help.examples = {{"qrxdeck help write", ""}};

    Verb& manual = AddVerb("man", "Print a manual page, as roff source", [this](RunReport& report) {
        return manuals_.empty() ? RunManual(info_, word_, report) : WriteManuals(info_, manuals_, report);
    });
    CLI::Option* manualVerb = manual.command->add_option(
        "COMMAND", word_, "The command that the page is of (default: the program)");
    Take(manual.command
             ->add_option("--into", manuals_, "Write the pages of the program and of all commands there")
             ->type_name("DIR")
             ->excludes(manualVerb),
         Values::FOLDERS);
    manual.examples = {{"qrxdeck man write | man -l -", ""}};

    Verb& completion = AddVerb("completion", "Print a script that completes command lines in a shell",
                               [this](RunReport& report) { return RunCompletion(info_, word_, report); });
    Take(completion.command->add_option("SHELL", word_, "bash, zsh or fish")->required(), Values::WORDS,
         {"bash", "zsh", "fish"});
    completion.more = {
        "Installed packages bring these scripts along. Without one, a line in the shell's start-up "
        "file loads it: in ~/.bashrc \"source <(qrxdeck completion bash)\", in ~/.zshrc, behind "
        "compinit, \"source <(qrxdeck completion zsh)\", in ~/.config/fish/config.fish \"qrxdeck "
        "completion fish | source\"."};
    completion.examples = {{"qrxdeck completion bash > qrxdeck.bash", ""}};

    std::vector<std::string> names;
    for (const Verb& verb : verbs_) names.push_back(verb.command->get_name());
    for (CLI::Option* option : {helpVerb, manualVerb}) Take(option, Values::WORDS, names);
}

OptionInfo CommandLine::InfoOf(const CLI::Option& option) const {
    OptionInfo info;
    for (const std::string& name : option.get_snames()) info.names.push_back("-" + name);
    for (const std::string& name : option.get_lnames()) info.names.push_back("--" + name);
    const bool takesValue = option.get_items_expected_max() > 0;
    if (info.names.empty()) info.place = option.get_name(true);
    // Behind a colon it says what is checked.
    const std::string type = option.get_type_name();
    if (takesValue && !info.names.empty()) info.type = type.substr(0, type.find(':'));
    info.about = option.get_description();
    info.required = option.get_required();
    info.many = option.get_items_expected_max() > 1 ||
                (takesValue && !option.get_allow_extra_args() && option.get_expected_max() > 1);
    const auto values = values_.find(&option);
    if (values != values_.end()) info.values = values->second;
    return info;
}

void CommandLine::Describe() {
    info_.name = kProgram;
    info_.version = QRX_VERSION;
    info_.about = kAbout;
    info_.exitCodes = kExitCodes;
    info_.more = {
        "A run that fails with 1 to 5 leaves an older file as it was; of several models the exit code is "
        "that of the worst."};
    for (const CLI::Option* option : app_.get_options({})) info_.options.push_back(InfoOf(*option));
    for (const Verb& verb : verbs_) {
        VerbInfo& info = info_.verbs.emplace_back();
        info.name = verb.command->get_name();
        info.about = verb.command->get_description();
        info.more = verb.more;
        info.exitCodes = verb.exitCodes;
        info.examples = verb.examples;
        for (const CLI::Option* option : verb.command->get_options({})) {
            if (option != verb.command->get_help_ptr()) info.options.push_back(InfoOf(*option));
        }
    }
}
