#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "study/sty_Identity.h"
#include "study/sty_MeshSums.h"
#include "study/sty_Study.h"

#include <algorithm>
#include <cerrno>
#include <filesystem>

namespace {

/// A row's line in one of the ledgers.
struct LinePlace {
    long long row = 0;
    long long begin = 0;
    int bytes = 0;
    short ledger = 0;
    bool done = false;
};

std::vector<std::string> LedgersIn(const std::string& folder) {
    std::vector<std::string> ledgers;
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(plt_Path(folder), error)) {
        if (sty_Ledger::IsLedger(entry.path().filename().string())) ledgers.push_back(entry.path().string());
    }
    std::ranges::sort(ledgers);
    return ledgers;
}

std::string LineAt(const sty_Descriptor& file, const LinePlace& place, const std::string& path) {
    std::string line(static_cast<std::size_t>(place.bytes), '\0');
    if (plt_ReadAt(file.Number(), line.data(), line.size(), place.begin) != place.bytes)
        throw sty_Refused("cannot read " + fnd_Quoted(path) + ": " + sty_ReasonOf(errno));
    return line;
}

void Count(const LinePlace& place, const std::string& line, sty_Merged& merged) {
    if (place.done) {
        ++merged.done;
        return;
    }
    ++merged.failed;
    if (merged.failures.size() < sty_Outcome::kMostFailures)
        merged.failures.push_back({place.row, {}, sty_ReasonIn(line)});
}

/// Shards may have come to a mesh file at different times.
void Compare(const std::string& line, sty_MeshSums& meshes, sty_Merged& merged) {
    const std::optional<sty_Entry> entry = sty_EntryOf(line);
    if (!entry || entry->deck.empty()) return;
    std::string problem = meshes.ContradictionOf(*entry);
    if (!problem.empty() && merged.contradictions.size() < sty_Outcome::kMostFailures)
        merged.contradictions.push_back({entry->row, {}, std::move(problem)});
}

/// "17, 201-250"; after many ranges "...".
class RangeText {
public:
    void Add(long long row) {
        if (row == last_ + 1 && last_ > 0) {
            last_ = row;
            return;
        }
        End();
        first_ = last_ = row;
    }
    std::string Text() {
        End();
        return text_ + (ranges_ > kMostRanges ? ", ..." : "");
    }

private:
    static constexpr int kMostRanges = 20;

    void End() {
        if (last_ == 0 || ++ranges_ > kMostRanges) return;
        if (!text_.empty()) text_ += ", ";
        text_ += std::to_string(first_);
        if (last_ > first_) text_ += "-" + std::to_string(last_);
    }

    long long first_ = 0;
    long long last_ = 0;
    int ranges_ = 0;
    std::string text_;
};

} // namespace

sty_Merged sty_Merge(const std::string& path) {
    std::error_code error;
    if (!std::filesystem::is_directory(plt_Path(path), error)) throw sty_NoStudy("there is no such folder");
    sty_Folder folder(path);
    const std::optional<std::string> text = folder.Read(sty_Folder::kIdentity);
    const std::optional<sty_Identity> identity = text ? sty_Identity::Of(*text) : std::nullopt;
    if (!identity)
        throw sty_NoStudy("found a folder without a study, expected one that has " +
                          std::string(sty_Folder::kIdentity));
    folder.Prepare();

    const std::vector<std::string> ledgers = LedgersIn(path);
    std::vector<sty_Descriptor> files;
    std::vector<LinePlace> places;
    for (const std::string& ledger : ledgers) {
        const auto number = static_cast<short>(files.size());
        files.emplace_back(plt_OpenToRead(ledger.c_str()));
        sty_ForEachLine(ledger, [&](std::string_view line, long long begin) {
            const std::optional<sty_Entry> entry = sty_EntryOf(line);
            if (!entry || entry->row < 1 || entry->row > identity->rows) return;
            const bool done = !entry->deck.empty() && folder.SizeOf(std::string(entry->deck)) == entry->bytes;
            // A deck that is gone is a row that is missing.
            if (!done && !entry->deck.empty()) return;
            places.push_back({entry->row, begin, static_cast<int>(line.size()), number, done});
        });
    }
    // Of several lines of a row one with a deck counts, else the last.
    std::ranges::stable_sort(places, [](const LinePlace& a, const LinePlace& b) {
        return a.row != b.row ? a.row < b.row : a.done < b.done;
    });

    sty_Merged merged;
    sty_MeshSums meshes(identity->templatePath);
    merged.rows = identity->rows;
    const auto write = [&](int file) {
        sty_LineWriter writer(file);
        for (std::size_t i = 0; i < places.size(); ++i) {
            if (i + 1 < places.size() && places[i + 1].row == places[i].row) continue;
            const auto ledger = static_cast<std::size_t>(places[i].ledger);
            const std::string line = LineAt(files[ledger], places[i], ledgers[ledger]);
            Count(places[i], line, merged);
            Compare(line, meshes, merged);
            writer.Add(line);
        }
        return writer.End();
    };
    folder.Write(sty_Ledger::NameOf(1, 1), write, true);
    RangeText missing;
    long long next = 1;
    for (const LinePlace& place : places) {
        for (; next < place.row; ++next) missing.Add(next);
        next = place.row + 1;
    }
    for (; next <= identity->rows; ++next) missing.Add(next);
    merged.missing = merged.rows - merged.done - merged.failed;
    merged.missingRows = missing.Text();
    return merged;
}
