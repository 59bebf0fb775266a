#include "study/sty_Ledger.h"

#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "study/sty_Json.h"

#include <cerrno>
#include <charconv>
#include <cstdio>

namespace {

constexpr std::string_view kRow = "{\"row\": ";
constexpr std::string_view kDeck = ", \"deck\": \"";
constexpr std::string_view kBytes = "\", \"bytes\": ";
constexpr std::string_view kSum = ", \"sha256\": \"";
constexpr std::string_view kMeshes = ", \"meshes\": ";
constexpr std::string_view kError = ", \"error\": [";
constexpr std::string_view kText = "\"text\": ";

bool TakeWord(std::string_view& text, std::string_view word) {
    if (!text.starts_with(word)) return false;
    text.remove_prefix(word.size());
    return true;
}

bool TakeNumber(std::string_view& text, long long& number) {
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc()) return false;
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    return true;
}

void AppendMember(std::string& json, const char* key, std::string_view text) {
    json.append(", \"").append(key).append("\": ");
    sty_AppendQuoted(json, text);
}

void AppendErrors(std::string& json, const std::vector<sty_RowError>& errors) {
    json += kError;
    for (const sty_RowError& error : errors) {
        if (&error != &errors.front()) json += ", ";
        json += '{';
        json += kText;
        sty_AppendQuoted(json, error.text);
        if (!error.column.empty()) AppendMember(json, "column", error.column);
        if (!error.pointer.empty()) AppendMember(json, "pointer", error.pointer);
        json += '}';
    }
    json += ']';
}

void AppendMeshes(std::string& json, const std::vector<std::pair<std::string, std::string>>& meshes) {
    if (meshes.empty()) return;
    json += kMeshes;
    const char* before = "[{\"file\": ";
    for (const auto& [file, sum] : meshes) {
        json += before;
        sty_AppendQuoted(json, file);
        json.append(kSum).append(sum).append("\"}");
        before = ", {\"file\": ";
    }
    json += ']';
}

/// The meshes that a line goes on with, empty where it names none.
std::string_view TakeMeshes(std::string_view line) {
    if (!TakeWord(line, kMeshes)) return {};
    // Within a name a quote has a backslash before it, and a sum ends in none.
    constexpr std::string_view kEnd = "\"}]";
    std::size_t end = line.find(kEnd);
    while (end != std::string_view::npos && line[end - 1] == '\\') end = line.find(kEnd, end + 1);
    return end == std::string_view::npos ? std::string_view() : line.substr(0, end + kEnd.size());
}

void AppendFindings(std::string& json, const std::vector<fnd_Finding>& findings) {
    json += ", \"findings\": [";
    for (const fnd_Finding& finding : findings) {
        if (&finding != &findings.front()) json += ", ";
        json += "{\"severity\": ";
        sty_AppendQuoted(json, fnd_SeverityWord(finding.code->severity));
        AppendMember(json, "code", finding.code->name);
        AppendMember(json, "pointer", finding.place);
        AppendMember(json, "text", finding.Text());
        json += '}';
    }
    json += ']';
}

} // namespace

std::string sty_Result::Reason() const {
    std::string text;
    if (errors.empty()) return text;
    const sty_RowError& first = errors.front();
    if (!first.column.empty()) text += first.column + ": ";
    if (!first.pointer.empty() && first.pointer != first.column) text += first.pointer + ": ";
    text += first.text;
    if (errors.size() > 1) text += "; " + std::to_string(errors.size() - 1) + " more";
    return text;
}

std::string sty_LineOf(const sty_Result& result) {
    std::string json(kRow);
    json += std::to_string(result.row);
    if (result.IsDone()) {
        json.append(kDeck).append(result.deck);
        json.append(kBytes).append(std::to_string(result.bytes));
        json.append(kSum).append(result.sha256).append("\"");
        AppendMeshes(json, result.meshes);
    } else {
        AppendErrors(json, result.errors);
    }
    if (!result.name.empty()) AppendMember(json, "name", result.name);
    char seconds[40];
    std::snprintf(seconds, sizeof seconds, ", \"seconds\": %.6f", result.seconds);
    json.append(seconds).append(", \"parameters\": ").append(result.parameters);
    AppendFindings(json, result.findings);
    json += "}\n";
    return json;
}

std::optional<sty_Entry> sty_EntryOf(std::string_view line) {
    sty_Entry entry;
    if (!line.ends_with("]}") || !TakeWord(line, kRow) || !TakeNumber(line, entry.row)) return std::nullopt;
    if (line.starts_with(kError)) return entry;
    if (!TakeWord(line, kDeck)) return std::nullopt;
    // Names of decks have no character that JSON escapes.
    entry.deck = line.substr(0, line.find('"'));
    line.remove_prefix(entry.deck.size());
    if (entry.deck.empty() || !TakeWord(line, kBytes) || !TakeNumber(line, entry.bytes) ||
        !TakeWord(line, kSum))
        return std::nullopt;
    line.remove_prefix(std::min(line.find('"'), line.size()));
    if (TakeWord(line, "\"")) entry.meshes = TakeMeshes(line);
    return entry;
}

std::string sty_ReasonIn(std::string_view line) {
    const std::size_t text = line.find(kText);
    if (text == std::string_view::npos) return {};
    line.remove_prefix(text + kText.size() + 1);
    std::string reason;
    for (std::size_t i = 0; i < line.size() && line[i] != '"'; ++i) {
        if (line[i] == '\\' && i + 1 < line.size()) ++i;
        reason += line[i];
    }
    return reason;
}

std::size_t sty_ForEachLine(const std::string& path,
                            const std::function<void(std::string_view line, long long begin)>& take) {
    sty_File file(path);
    std::string rest;
    long long begin = 0;
    for (;;) {
        std::string_view piece = file.Next();
        if (piece.empty()) break;
        for (std::size_t end = piece.find('\n'); end != std::string_view::npos; end = piece.find('\n')) {
            std::string_view line = piece.substr(0, end);
            if (!rest.empty()) line = rest.append(line);
            take(line, begin);
            begin += static_cast<long long>(line.size()) + 1;
            rest.clear();
            piece.remove_prefix(end + 1);
        }
        rest.append(piece);
    }
    if (file.Error() != 0 && file.Error() != ENOENT)
        throw sty_Refused("cannot read " + fnd_Quoted(path) + ": " + sty_ReasonOf(file.Error()));
    return rest.size();
}

std::string sty_Ledger::NameOf(int shard, int shards) {
    if (shards <= 1) return "study.jsonl";
    const std::string most = std::to_string(shards);
    const std::string number = std::to_string(shard);
    return "study." + std::string(most.size() - number.size(), '0') + number + "-of-" + most + ".jsonl";
}

bool sty_Ledger::IsLedger(std::string_view name) {
    return name.starts_with("study.") && name.ends_with(".jsonl");
}

bool sty_Ledger::Exists() const {
    return folder_.SizeOf(name_) >= 0;
}

long long sty_Ledger::TakeUp(sty_DoneRows& done, const std::function<void(const sty_Entry& entry)>& look) {
    bool clean = true;
    long long count = 0;
    const auto walk = [&](const std::function<void(std::string_view line, const sty_Entry& entry)>& take) {
        sty_DoneRows seen = done;
        count = 0;
        const std::size_t cutOff = sty_ForEachLine(Path(), [&](std::string_view line, long long) {
            const std::optional<sty_Entry> entry = sty_EntryOf(line);
            const bool good = entry && seen.IsRow(entry->row) && !entry->deck.empty() &&
                              !seen.Has(entry->row) &&
                              folder_.SizeOf(std::string(entry->deck)) == entry->bytes;
            clean = clean && good;
            if (!good) return;
            seen.Add(entry->row);
            ++count;
            take(line, *entry);
        });
        clean = clean && cutOff == 0;
        return seen;
    };
    sty_DoneRows seen = walk([&](std::string_view, const sty_Entry& entry) { look(entry); });
    if (!clean) {
        // The lines that stay, as a new file.
        folder_.Write(
            name_,
            [&](int file) {
                sty_LineWriter writer(file);
                walk([&](std::string_view line, const sty_Entry&) { writer.Add(line); });
                return writer.End();
            },
            true);
    }
    done = std::move(seen);
    return count;
}

void sty_Ledger::Open() {
    file_ = sty_Descriptor(plt_OpenToAppend(folder_.Number(), name_.c_str()));
    plt_Status found = {};
    if (!file_.IsOpen() || plt_InspectOpen(file_.Number(), &found) != 0)
        throw sty_Refused("cannot open " + fnd_Quoted(Path()) + ": " + sty_ReasonOf(errno));
    bytes_ = found.st_size;
}

void sty_Ledger::Append(const std::string& line) {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (const int error = whf_WriteAll(file_.Number(), line); error != 0) {
        // A line that is cut off would spoil the next one.
        plt_Truncate(file_.Number(), bytes_);
        throw sty_Refused("cannot write " + fnd_Quoted(Path()) + ": " + sty_ReasonOf(error));
    }
    bytes_ += static_cast<long long>(line.size());
}
