#include "deck/oif_Writer.h"
#include "deck_reader/drd_Diff.h"
#include "deck_reader/drd_Text.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"
#include "platform/plt_Files.h"
#include "tools/CommandParts.h"
#include "tools/DeckCommands.h"

#include <algorithm>
#include <filesystem>

using nlohmann::ordered_json;

namespace {

/// A fresh folder that goes with the object.
class TemporaryDeck {
public:
    TemporaryDeck() : path_(plt_MakeTemporaryFolder("qrxdeck-")) {}
    TemporaryDeck(const TemporaryDeck&) = delete;
    TemporaryDeck& operator=(const TemporaryDeck&) = delete;
    ~TemporaryDeck() {
        std::error_code error;
        if (IsMade()) std::filesystem::remove_all(plt_Path(path_), error);
    }
    bool IsMade() const { return !path_.empty(); }
    std::string Job() const { return path_ + "/deck"; }

private:
    std::string path_;
};

/// Reads the deck of a model.
bool ReadDeckOfModel(const std::string& path, drd_Deck& deck, RunReport& report) {
    mdf_Report found;
    const std::unique_ptr<odb_Odb> odb = ReadModelInput(path, found);
    if (odb == nullptr || found.HasErrors()) {
        report.AddAll(found);
        return false;
    }
    const TemporaryDeck folder;
    if (!folder.IsMade()) {
        report.Error(path, "no folder can be made for its deck");
        return false;
    }
    try {
        oif_Writer(*odb).WriteInputFile(folder.Job().c_str());
    } catch (const QRXBasException& failure) {
        report.WriterError(failure.what(), failure.Context());
        return false;
    }
    drd_Findings findings;
    deck = ReadDeck(folder.Job() + ".inp", {}, findings);
    const bool isWhole = qio_LastReport().opened && qio_LastReport().error == 0;
    if (!isWhole) report.Error(path, "its deck can't be written");
    deck.files[0].name = "deck of " + InputName(path);
    return isWhole;
}

constexpr std::size_t kShownComments = 10;

ordered_json PlaceOf(const drd_Deck& deck, drd_Place place) {
    if (place.file < 0) return nullptr;
    return {{"file", deck.FileName(place)}, {"line", place.line}};
}

std::string Shown(const drd_Deck& deck, drd_Place place) {
    return place.file < 0 ? "-" : deck.FileName(place) + ":" + std::to_string(place.line);
}

class Colours {
public:
    explicit Colours(bool on) : on_(on) {}
    std::string Of(drd_ChangeEnm change, const std::string& text) const {
        if (!on_) return text;
        constexpr const char* kCodes[] = {"32", "31", "33", "36", "35"};
        return "\033[" + std::string(kCodes[static_cast<std::size_t>(change)]) + "m" + text + "\033[0m";
    }
    std::string Dim(const std::string& text) const { return on_ ? "\033[2m" + text + "\033[0m" : text; }

private:
    bool on_;
};

std::string SummaryOf(const drd_DiffResult& result) {
    std::string text;
    for (const auto& [kind, changes] : result.summary) {
        for (const auto& [change, count] : changes) {
            text += "  " + kind + ": " + std::to_string(count) + " " + std::string(drd_WordOf(change)) + "\n";
        }
    }
    return text;
}

void PrintComments(const drd_DiffResult& result, RunReport& report) {
    if (result.commentsRemoved.empty() && result.commentsAdded.empty()) return;
    report.Print("comments, which make no difference:\n");
    const auto print = [&report](const std::vector<std::string>& comments, const char* sign) {
        for (std::size_t i = 0; i < std::min(comments.size(), kShownComments); ++i) {
            report.Print(std::string("  ") + sign + " " + comments[i] + "\n");
        }
        if (comments.size() > kShownComments) {
            report.Print(std::string("  ") + sign + " and " +
                         std::to_string(comments.size() - kShownComments) + " more\n");
        }
    };
    print(result.commentsRemoved, "-");
    print(result.commentsAdded, "+");
}

void Print(const drd_DiffResult& result, const drd_Deck& first, const drd_Deck& second, RunReport& report) {
    const Colours colours(report.OutputHasColours());
    for (const drd_Difference& difference : result.differences) {
        report.Print(
            colours.Of(difference.change, difference.text) + "\n" +
            colours.Dim("    " + Shown(first, difference.first) + "  " + Shown(second, difference.second)) +
            "\n");
    }
    if (!result.IsEqual()) report.Print("in all:\n" + SummaryOf(result));
    PrintComments(result, report);
}

void Fill(const drd_DiffResult& result, const drd_Deck& first, const drd_Deck& second, RunReport& report) {
    ordered_json& root = report.Member("differences") = ordered_json::array();
    for (const drd_Difference& difference : result.differences) {
        root.push_back({{"change", drd_WordOf(difference.change)},
                        {"kind", difference.kind},
                        {"text", difference.text},
                        {"first", PlaceOf(first, difference.first)},
                        {"second", PlaceOf(second, difference.second)}});
    }
    ordered_json& summary = report.Member("summary") = ordered_json::object();
    for (const auto& [kind, changes] : result.summary) {
        for (const auto& [change, count] : changes) summary[kind][std::string(drd_WordOf(change))] = count;
    }
    report.Member("comments") = {{"removed", result.commentsRemoved}, {"added", result.commentsAdded}};
}

bool ReadSide(const std::string& path, drd_Deck& deck, const DeckRequest& request, RunReport& report) {
    if (!IsDeck(path)) return ReadDeckOfModel(path, deck, report);
    drd_Findings findings;
    deck = ReadDeckWatched(path, request, findings, report);
    if (!findings.HasErrors()) return true;
    // A deck with faults in its text can be compared as far as it was read; one that isn't there can't.
    AddFindings(deck, findings, report);
    return !findings.Counts().contains("deck-unreadable") && !findings.Counts().contains("not-a-deck");
}

} // namespace

bool ReadDeckOrModel(const std::string& path, drd_Deck& deck, const DeckRequest& request, RunReport& report) {
    return ReadSide(path, deck, request, report);
}

int RunDiff(const DiffRequest& request, RunReport& report) {
    if (request.second.empty()) {
        report.Error("qrxdeck", "B is required: the deck or model to compare with");
        return 2;
    }
    drd_DiffOptions options;
    options.tolerance = request.tolerance;
    std::vector<std::string_view> words;
    drd_SplitFields(request.ignore, words);
    for (const std::string_view word : words) {
        bool* flag = word == "comments" ? &options.ignoreComments
                     : word == "names"  ? &options.ignoreNames
                     : word == "order"  ? &options.ignoreOrder
                     : word == "titles" ? &options.ignoreTitles
                     : word == "output" ? &options.ignoreOutput
                                        : nullptr;
        if (flag == nullptr) {
            report.Error("qrxdeck", "there is nothing called '" + std::string(word) +
                                        "' to ignore; there are comments, names, order, titles and output");
            return 2;
        }
        *flag = true;
    }
    if (!(options.tolerance >= 0.0)) {
        report.Error("qrxdeck", "a tolerance is a number from 0");
        return 2;
    }
    drd_Deck first;
    drd_Deck second;
    const bool firstIsRead = ReadSide(request.first, first, request.deck, report);
    if (!ReadSide(request.second, second, request.deck, report) || !firstIsRead) return 2;
    const drd_DiffResult result = drd_Diff(first, second, options);
    if (report.AsJson()) {
        Fill(result, first, second, report);
    } else {
        Print(result, first, second, report);
    }
    return result.IsEqual() ? 0 : 1;
}
