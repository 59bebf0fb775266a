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

std::string drd_Parser::Continued(std::string_view line, std::string& asItStands) {
    std::string header(line);
    asItStands = header;
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
        asItStands.append("\n").append(next);
        lastBytes = next.size();
    }
    return header;
}

bool drd_Parser::ParseHeader(std::string_view header, drd_Keyword& keyword) {
    if (!drd_SplitFields(header.substr(1), fields_)) {
        findings_.Add("quote-left-open", keyword.place, drd_Shown(header), "a second double quote");
    }
    if (fields_.empty() || fields_[0].empty()) {
        findings_.Add("keyword-without-name", keyword.place, drd_Shown(header), "a keyword behind the *");
        return false;
    }
    keyword.name.assign(fields_[0]);
    keyword.key = drd_FoldKey(fields_[0]);
    keyword.row = drd_FindKeyword(keyword.key);
    keyword.parameters.reserve(fields_.size() - 1);
    for (std::size_t i = 1; i < fields_.size(); ++i) {
        const std::string_view field = fields_[i];
        if (field.empty()) continue;
        const std::size_t equals = drd_FindOutsideQuotes(field, '=');
        drd_Parameter parameter;
        parameter.name.assign(drd_Trim(field.substr(0, equals)));
        parameter.key = drd_FoldKey(parameter.name);
        if (parameter.key.empty()) {
            findings_.Add("parameter-without-name", keyword.place, drd_Shown(field), "NAME=value");
        }
        parameter.hasValue = equals != std::string_view::npos;
        if (parameter.hasValue) parameter.value.assign(drd_Trim(field.substr(equals + 1)));
        keyword.parameters.push_back(std::move(parameter));
    }
    return true;
}

void drd_Parser::Keyword(std::string_view line) {
    drd_Keyword keyword;
    keyword.place = Here();
    std::string asItStands;
    const std::string header = Continued(line, asItStands);
    if (!ParseHeader(header, keyword)) return;
    if (keyword.key == "include" && options_.followIncludes && Include(keyword)) return;
    keyword.header = Keep(asItStands, keyword.place);
    AddKeyword(std::move(keyword));
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

void drd_Parser::AddKeyword(drd_Keyword keyword) {
    bulk_ = nullptr;
    keyword.firstLine = deck_.lines.Size();
    keyword.end = static_cast<int>(deck_.keywords.size()) + 1;
    PlaceInBlock(keyword);
    FindOwner(keyword);
    deck_.keywords.push_back(std::move(keyword));
    const std::string& key = Last().key;
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
    block.name = drd_NameOf(keyword.Value("name"));
    block.parent = blockStack_.back();
    block.begin = static_cast<int>(deck_.keywords.size());
    blockStack_.push_back(static_cast<int>(deck_.blocks.size()));
    deck_.blocks.push_back(std::move(block));
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
