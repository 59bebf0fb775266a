#include "deck_reader/drd_Parser.h"
#include "deck_reader/drd_Text.h"
#include "platform/plt_Files.h"

#include <algorithm>

namespace {

bool EndsWithComma(std::string_view line) {
    line = drd_Trim(line);
    return !line.empty() && line.back() == ',';
}

/// ", parameter": a comma at the head of a line that goes on.
bool BeginsWithCommaAndWord(std::string_view line) {
    if (!line.starts_with(",")) return false;
    line = drd_Trim(line.substr(1));
    return !line.empty() && drd_IsLetter(line.front());
}

struct BlockWord {
    std::string_view key;
    drd_BlockEnm kind;
    bool ends;
};
constexpr BlockWord kBlockPrefixes[] = {
    {"part", drd_BlockEnm::PART, false},          {"endpart", drd_BlockEnm::PART, true},
    {"instance", drd_BlockEnm::INSTANCE, false},  {"endinstance", drd_BlockEnm::INSTANCE, true},
    {"assembly", drd_BlockEnm::ASSEMBLY, false},  {"endassembly", drd_BlockEnm::ASSEMBLY, true},
    {"step", drd_BlockEnm::STEP, false},          {"endstep", drd_BlockEnm::STEP, true},
    {"loadcase", drd_BlockEnm::LOAD_CASE, false}, {"endloadcase", drd_BlockEnm::LOAD_CASE, true},
};

/// The blocks that one of the kind stands in.
bool MayStandInside(drd_BlockEnm inner, drd_BlockEnm outer) {
    switch (inner) {
    case drd_BlockEnm::INSTANCE: return outer == drd_BlockEnm::ASSEMBLY;
    case drd_BlockEnm::LOAD_CASE: return outer == drd_BlockEnm::STEP;
    default: return outer == drd_BlockEnm::MODEL;
    }
}

std::string EndWord(drd_BlockEnm kind) {
    return "*End " + std::string(drd_WordOf(kind));
}

} // namespace

std::string_view drd_Parser::Header(std::string_view line, std::string_view& asItStands) {
    if (!EndsWithComma(line) && line.size() <= drd_BreakLimit) return asItStands = deck_.texts.Keep(line);
    std::string header(line);
    std::string whole = header;
    std::size_t lastBytes = line.size();
    std::string_view next;
    for (bool goesOn = EndsWithComma(line); goesOn || lastBytes > drd_BreakLimit;
         goesOn = EndsWithComma(next)) {
        const drd_Place place = Here();
        if (!NextLine(next)) break;
        if (goesOn && next.starts_with("**")) {
            Comment(next);
            next = ",";
            continue;
        }
        const std::string_view text = drd_Trim(next);
        const bool isParameter = !text.empty() && drd_IsLetter(text.front());
        if (goesOn ? !isParameter : !BeginsWithCommaAndWord(next)) {
            if (goesOn && !text.empty()) {
                findings_.Add("keyword-left-open", place, "a keyword line that ends with a comma",
                              "a parameter on the next line");
            }
            PutBack(next);
            break;
        }
        if (!goesOn) {
            findings_.Add("comma-ahead", Here(), drd_Shown(next), "the comma at the end of the line before");
        }
        header.append(next);
        whole.append("\n").append(next);
        lastBytes = next.size();
    }
    asItStands = deck_.texts.Keep(whole);
    return header.size() == whole.size() ? asItStands : deck_.texts.Keep(header);
}

drd_Word drd_Parser::Folded(drd_Word word) {
    const auto isFolded = [](char c) { return !drd_IsBlank(c) && c == drd_LowerCase(c); };
    if (std::all_of(word.begin(), word.end(), isFolded)) return word;
    const auto [place, isNew] = spellings_.TryEmplace(word, static_cast<int>(folded_.size()));
    if (isNew) folded_.push_back(deck_.texts.Keep(drd_FoldKey(word)));
    return folded_[static_cast<std::size_t>(place)];
}

drd_Word drd_Parser::NameOf(std::string_view value) {
    const std::string_view name = drd_Trim(value);
    return name.find('"') == std::string_view::npos ? drd_Word(name) : deck_.texts.Keep(drd_NameOf(name));
}

bool drd_Parser::ParseHeader(std::string_view header, drd_Keyword& keyword) {
    if (!drd_SplitFields(header.substr(1), fields_)) {
        findings_.Add("quote-left-open", keyword.place, drd_Shown(header), "a second double quote");
    }
    if (fields_.empty() || fields_[0].empty()) {
        findings_.Add("keyword-without-name", keyword.place, drd_Shown(header), "a keyword behind the *");
        return false;
    }
    keyword.name = fields_[0];
    keyword.key = Folded(fields_[0]);
    keyword.row = drd_FindKeyword(keyword.key);
    parameters_.clear();
    for (std::size_t i = 1; i < fields_.size(); ++i) {
        const std::string_view field = fields_[i];
        if (field.empty()) continue;
        const std::size_t equals = drd_FindOutsideQuotes(field, '=');
        drd_Parameter parameter;
        parameter.name = drd_Trim(field.substr(0, equals));
        parameter.key = Folded(parameter.name);
        if (parameter.key.empty()) {
            findings_.Add("parameter-without-name", keyword.place, drd_Shown(field), "NAME=value");
        }
        parameter.hasValue = equals != std::string_view::npos;
        if (parameter.hasValue) parameter.value = drd_Trim(field.substr(equals + 1));
        parameters_.push_back(parameter);
    }
    keyword.parameters = deck_.texts.Keep(parameters_);
    return true;
}

void drd_Parser::Keyword(std::string_view line) {
    drd_Keyword keyword;
    keyword.place = Here();
    std::string_view asItStands;
    const std::string_view header = Header(line, asItStands);
    if (!ParseHeader(header, keyword)) return;
    if (keyword.key == "include" && options_.followIncludes && Include(keyword)) return;
    keyword.header = {asItStands.data(), static_cast<std::uint32_t>(asItStands.size()), keyword.place.file,
                      keyword.place.line};
    AddKeyword(keyword);
}

/// True when the include is done with: its lines come next.
bool drd_Parser::Include(const drd_Keyword& keyword) {
    const std::string name = drd_NameOf(keyword.Value("input"));
    if (name.empty()) {
        findings_.Add("include-without-file", keyword.place, "an include without a file", "input=FILE");
        return true;
    }
    const std::filesystem::path folder =
        plt_Path(deck_.files[static_cast<std::size_t>(keyword.place.file)].name).parent_path();
    OpenFile(folder / plt_Path(name), keyword.place);
    return true;
}

void drd_Parser::AddKeyword(drd_Keyword& keyword) {
    bulk_ = nullptr;
    keyword.firstLine = deck_.lines.Size();
    keyword.end = static_cast<int>(deck_.keywords.size()) + 1;
    PlaceInBlock(keyword);
    FindOwner(keyword);
    if (keyword.row != nullptr && keyword.row->defines != drd_KindEnm::NONE) {
        deck_.definitions.Add(static_cast<int>(deck_.keywords.size()));
    }
    deck_.keywords.push_back(keyword);
    const drd_Word key = keyword.key;
    if (key == "node") {
        BeginNodes();
    } else if (key == "element") {
        BeginElements();
    } else if (key == "nset") {
        BeginSet(drd_KindEnm::NODE_SET);
    } else if (key == "elset") {
        BeginSet(drd_KindEnm::ELEMENT_SET);
    }
}

void drd_Parser::PlaceInBlock(drd_Keyword& keyword) {
    const auto word = std::find_if(std::begin(kBlockPrefixes), std::end(kBlockPrefixes),
                                   [&keyword](const BlockWord& w) { return w.key == keyword.key; });
    if (word == std::end(kBlockPrefixes)) {
        keyword.block = blockStack_.back();
        return;
    }
    owner_ = -1;
    if (word->ends) {
        CloseBlock(word->kind, keyword);
    } else {
        OpenBlock(word->kind, keyword);
    }
    keyword.block = blockStack_.back();
    if (word->ends && deck_.blocks[static_cast<std::size_t>(blockStack_.back())].kind == word->kind)
        LeaveBlock();
}

void drd_Parser::OpenBlock(drd_BlockEnm kind, const drd_Keyword& keyword) {
    const auto fits = [kind, this](int block) {
        return MayStandInside(kind, deck_.blocks[static_cast<std::size_t>(block)].kind);
    };
    // What is open and can't hold the new block has lost its end. Where nothing can hold it, it stands where
    // it is.
    if (std::any_of(blockStack_.begin(), blockStack_.end(), fits)) {
        while (!fits(blockStack_.back())) LeaveBlock();
    }
    drd_Block block;
    block.kind = kind;
    block.name = NameOf(keyword.Value("name"));
    block.parent = blockStack_.back();
    block.begin = static_cast<int>(deck_.keywords.size());
    blockStack_.push_back(static_cast<int>(deck_.blocks.size()));
    deck_.blocks.push_back(block);
}

void drd_Parser::CloseBlock(drd_BlockEnm kind, const drd_Keyword& keyword) {
    const auto isOfKind = [kind, this](int block) {
        return deck_.blocks[static_cast<std::size_t>(block)].kind == kind;
    };
    if (!std::any_of(blockStack_.begin(), blockStack_.end(), isOfKind)) {
        findings_.Add("end-without-begin", keyword.place, drd_Shown("*" + keyword.name),
                      "*" + std::string(drd_WordOf(kind)) + " ahead of it");
        return;
    }
    while (!isOfKind(blockStack_.back())) LeaveBlock();
    deck_.blocks[static_cast<std::size_t>(blockStack_.back())].end = static_cast<int>(deck_.keywords.size());
}

void drd_Parser::LeaveBlock() {
    drd_Block& block = deck_.blocks[static_cast<std::size_t>(blockStack_.back())];
    blockStack_.pop_back();
    block.last = static_cast<int>(deck_.keywords.size());
    owner_ = -1;
    if (block.end >= 0) {
        ++block.last; // its end is filed next
        return;
    }
    findings_.Add("block-left-open", deck_.keywords[static_cast<std::size_t>(block.begin)].place,
                  "the " + std::string(drd_WordOf(block.kind)) + " " +
                      drd_Shown(std::string_view(block.name)) + " has no end",
                  EndWord(block.kind));
}

void drd_Parser::FindOwner(drd_Keyword& keyword) {
    const int index = static_cast<int>(deck_.keywords.size());
    // A keyword that isn't known may be an option as well as not.
    const bool isKnown = keyword.row != nullptr;
    drd_Keyword* owner = owner_ < 0 ? nullptr : &deck_.keywords[static_cast<std::size_t>(owner_)];
    const bool isOption = owner != nullptr && (!isKnown || keyword.row->IsOptionOf(owner->row->owns));
    if (isOption) {
        keyword.parent = owner_;
        owner->end = index + 1;
    } else {
        owner_ = isKnown && keyword.row->owns != drd_GroupEnm::NONE ? index : -1;
    }
}
