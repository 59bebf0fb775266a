#include "deck_reader/drd_Parser.h"

#include "deck_reader/drd_Text.h"
#include "platform/plt_Files.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <system_error>

namespace {

constexpr std::size_t kDeepestInclude = 64;
constexpr std::size_t kMostIncludes = 100000;

} // namespace

drd_Deck drd_ReadDeck(const std::string& path, const drd_ReadOptions& options, drd_Findings& findings) {
    drd_Parser parser(options, findings);
    parser.OpenMain(path);
    return parser.Run();
}

drd_Deck drd_ReadDeckText(std::string_view text, const std::string& name, const drd_ReadOptions& options,
                          drd_Findings& findings) {
    drd_Parser parser(options, findings);
    parser.OpenText(text, name);
    return parser.Run();
}

void drd_Parser::OpenMain(const std::string& path) {
    OpenFile(plt_Path(path), {-1, 0});
    if (deck_.files.empty()) deck_.files.push_back({path, {-1, 0}});
}

void drd_Parser::OpenText(std::string_view text, const std::string& name) {
    deck_.files.push_back({name, {-1, 0}});
    sources_.push_back(std::make_unique<Source>(Source{drd_LineSource(text), 0, {}}));
    current_ = sources_.back().get();
}

void drd_Parser::OpenFile(const std::filesystem::path& path, drd_Place includedAt) {
    const bool isMain = includedAt.file < 0;
    const drd_Place place = isMain ? drd_Place{0, 0} : includedAt;
    std::error_code error;
    const std::filesystem::path canonical = std::filesystem::weakly_canonical(path, error);
    for (const auto& source : sources_) {
        if (!isMain && !error && source->path == canonical) {
            findings_.Add("include-in-circle", place,
                          "the file " + drd_Shown(path.string()) + " includes itself");
            return;
        }
    }
    if (sources_.size() >= kDeepestInclude || ++includes_ > kMostIncludes) {
        findings_.Add("include-in-circle", place, "the file " + drd_Shown(path.string()),
                      sources_.size() >= kDeepestInclude ? "at most 64 files one in the other"
                                                         : "at most 100000 includes");
        return;
    }
    errno = 0;
    std::FILE* file = !isMain && !std::filesystem::is_regular_file(path, error)
                          ? nullptr
                          : plt_OpenStream(path.string().c_str(), "rb");
    if (file == nullptr || std::filesystem::is_directory(path, error)) {
        const int reason = errno;
        if (file != nullptr) std::fclose(file);
        findings_.Add("deck-unreadable", place,
                      "the file " + drd_Shown(path.string()) + ": " +
                          (reason != 0 ? std::generic_category().message(reason) : "it is no file"));
        return;
    }
    deck_.files.push_back({path.string(), includedAt});
    sources_.push_back(std::make_unique<Source>(Source{drd_LineSource(file, options_.progress),
                                                       static_cast<int>(deck_.files.size()) - 1, canonical}));
    current_ = sources_.back().get();
}

void drd_Parser::CloseSource() {
    const Source& source = *current_;
    const drd_Place place{source.file, source.lines.Line() + 1};
    if (source.lines.IsBinary()) {
        findings_.Add("not-a-deck", place, "a zero byte", "text", "the rest of the file is not read");
    }
    if (source.lines.HasFailed())
        findings_.Add("deck-unreadable", place, "the file can't be read to its end");
    if (source.lines.HasLoneReturns()) {
        findings_.Add("lone-carriage-return", {source.file, 1}, "lines that end with a carriage return alone",
                      "line feeds");
    }
    sources_.pop_back();
    current_ = sources_.empty() ? nullptr : sources_.back().get();
}

void drd_Parser::LookAtLine(std::string_view line) {
    const bool hasTab = current_->lines.MayHaveTabs() && line.find('\t') != std::string_view::npos;
    if (!hasTab && line.size() <= drd_LineLimit) return;
    if (current_->lines.WasCut()) {
        findings_.Add("line-too-long", Here(), "more than a million bytes");
    } else if (line.size() > drd_LineLimit && !line.starts_with("**") && findings_.Wants("line-over-limit")) {
        findings_.Add("line-over-limit", Here(), drd_Counted(line.size(), "byte"), "at most 256");
    }
    if (hasTab && !line.starts_with("**")) findings_.Add("tab-in-line", Here(), "a tab", "blanks");
}

bool drd_Parser::NextLine(std::string_view& line) {
    while (current_ != nullptr) {
        if (current_->hasPending) {
            current_->hasPending = false;
            line = current_->pending;
            return true;
        }
        if (current_->lines.Next(line)) {
            LookAtLine(line);
            return true;
        }
        CloseSource();
    }
    return false;
}

void drd_Parser::PutBack(std::string_view line) {
    current_->pending = line;
    current_->hasPending = true;
}

bool drd_Parser::NextDataLine(std::string_view& line) {
    while (NextLine(line)) {
        if (line.empty() || line.front() != '*') return true;
        if (!line.starts_with("**")) {
            PutBack(line);
            return false;
        }
        Comment(line);
    }
    return false;
}

drd_Line drd_Parser::Keep(std::string_view text, drd_Place place) {
    const drd_Word kept = deck_.texts.Keep(text);
    return {kept.data(), static_cast<std::uint32_t>(kept.size()), place.file, place.line};
}

void drd_Parser::Comment(std::string_view line) {
    const bool isFirst = deck_.keywords.empty();
    const auto ahead = isFirst ? 0U : static_cast<std::uint32_t>(deck_.lines.Size() - Last().firstLine);
    deck_.comments.Add({Keep(line, Here()), static_cast<int>(deck_.keywords.size()) - 1, ahead});
}

drd_Deck drd_Parser::Run() {
    deck_.blocks.push_back({});
    std::string_view line;
    while (NextLine(line)) {
        if (line.starts_with("**")) {
            Comment(line);
        } else if (line.starts_with("*")) {
            Keyword(line);
        } else if (bulk_ != nullptr) {
            (this->*bulk_)(line);
        } else {
            Data(line);
        }
    }
    Finish();
    return std::move(deck_);
}

void drd_Parser::Data(std::string_view line) {
    if (deck_.keywords.empty()) {
        if (!toldDataBeforeKeyword_ && !drd_Trim(line).empty()) {
            toldDataBeforeKeyword_ = true;
            findings_.Add("data-before-keyword", Here(), drd_Shown(line), "a keyword line, with * in front");
        }
        return;
    }
    if (Last().Row() != nullptr && !Last().HasText() && std::count(line.begin(), line.end(), '"') % 2 != 0) {
        findings_.Add("quote-left-open", Here(), drd_Shown(line), "a second double quote");
    }
    deck_.lines.Add(Keep(line, Here()));
    ++Last().lines;
}

void drd_Parser::Finish() {
    while (blockStack_.size() > 1) LeaveBlock();
    deck_.blocks[0].last = static_cast<int>(deck_.keywords.size());
    for (drd_Mesh& mesh : deck_.meshes) {
        mesh.nodes.Trim();
        mesh.coordinates.Trim();
        mesh.elements.Trim();
        mesh.connectivity.Trim();
        mesh.owners.Trim();
    }
    deck_.keywords.shrink_to_fit();
    deck_.blocks.shrink_to_fit();
    deck_.setParts.shrink_to_fit();
    deck_.definitions.Trim();
    deck_.labels.Trim();
    deck_.lines.Trim();
    deck_.comments.Trim();
    for (drd_Mesh& mesh : deck_.meshes) {
        // Nodes ahead of the first owner have none.
        if (!mesh.owners.IsEmpty()) {
            while (mesh.owners.Size() < mesh.connectivity.Size()) mesh.owners.Add(-1);
        }
    }
}
