#ifndef QRX_TOOLS_COMMANDLINE_H
#define QRX_TOOLS_COMMANDLINE_H

#include "tools/Commands.h"
#include "tools/DeckCommands.h"
#include "tools/HelpCommands.h"
#include "tools/OptionTree.h"
#include "tools/StudyCommand.h"
#include "tools/ViewCommand.h"

#include <CLI/CLI.hpp>

#include <deque>
#include <functional>
#include <map>
#include <string>
#include <vector>

/// What the program takes, and what it was given.
class CommandLine {
public:
    CommandLine();

    CLI::App& App() { return app_; }
    bool AsJson() const { return json_; }
    ReportOptions Options() const;
    /// The same as data.
    const ProgramInfo& Info() const { return info_; }
    /// What is wrong, in the words of the command line's reader but for a command or an option that isn't
    /// known.
    std::string Complaint(const CLI::ParseError& error, const std::vector<std::string>& words) const;
    /// The help that was asked for.
    std::string Help() const;
    ExitCode Run(RunReport& report);

private:
    using Values = OptionValues::KindEnm;
    using RunOne = std::function<ExitCode(const std::string& input, RunReport& report)>;

    struct Verb {
        CLI::App* command;
        std::function<ExitCode(RunReport& report)> run;
        std::vector<std::string> more;
        std::vector<std::pair<std::string, std::string>> examples;
        std::vector<std::pair<int, std::string>> exitCodes;
    };

    Verb& AddVerb(const char* name, const char* about, std::function<ExitCode(RunReport& report)> run);
    void AddWrite();
    void AddCheck();
    void AddDiff();
    void AddFlatten();
    void AddInfo();
    void AddMesh();
    void AddNew();
    void AddFormat();
    void AddStudy();
    void AddView();
    void AddTables();
    void AddAboutItself();

    /// Notes what the values of an option are.
    CLI::Option* Take(CLI::Option* option, Values kind, std::vector<std::string> words = {});
    void AddInput(CLI::App* command, std::string& file, const char* about,
                  const std::vector<std::string>& extensions);
    void AddInputs(CLI::App* command, const char* about, const std::vector<std::string>& extensions);
    CLI::Option* AddOutput(CLI::App* command, std::string& file, const char* about);
    static void AddModelName(CLI::App* command, std::string& name);
    void AddThreads(CLI::App* command);
    void AddJson(CLI::App* command);
    void AddStrictness(CLI::App* command);
    /// Runs the command on each of the inputs.
    ExitCode RunEach(const RunOne& run, RunReport& report) const;
    ExitCode RunWriteEach(RunReport& report) const;

    void Describe();
    OptionInfo InfoOf(const CLI::Option& option) const;

    CLI::App app_;
    std::deque<Verb> verbs_; // whose references stay good
    std::map<const CLI::Option*, OptionValues> values_;
    ProgramInfo info_;

    WriteRequest write_;
    FormatRequest format_;
    ViewRequest view_;
    MeshRequest mesh_;
    NewRequest new_;
    DeckRequest deck_;
    DiffRequest diff_;
    FlattenRequest flatten_;
    StudyCommand study_;
    std::vector<std::string> inputs_;
    std::vector<std::string> codes_;
    std::vector<std::string> ignored_;
    std::string word_;
    std::string colour_ = "auto";
    std::string modelName_;
    std::string schemaOutput_;
    std::string schemaClass_;
    std::string classFamily_;
    std::string stepType_;
    std::string manuals_;
    bool textOfDeck_ = false;
    bool json_ = false;
    bool strict_ = false;
    bool all_ = false;
    bool failFast_ = false;
    bool history_ = false;
    int threads_ = 0;
};

#endif
