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

const drd_Spelling* drd_Parser::SpellingOf(drd_Word word) {
    const auto [place, isNew] = spellingIndex_.TryEmplace(word, static_cast<int>(spellings_.size()));
    if (!isNew) return spellings_[static_cast<std::size_t>(place)];
    drd_Spelling spelling;
    spelling.name = word;
    spelling.key = deck_.texts.Keep(drd_FoldKey(word));
    spelling.row = drd_FindKeyword(spelling.key);
    spelling.mark = drd_FindBlockMark(spelling.key);
    spelling.data = drd_DataOf(spelling.key);
    spelling.dataRefs = drd_DataRefs(spelling.key);
    spelling.parameterRefs = drd_ParameterRefs(spelling.key);
    return spellings_.emplace_back(deck_.texts.KeepOne(spelling));
}

drd_Word drd_Parser::NameOf(std::string_view value) {
    const std::string_view name = drd_Trim(value);
    return name.find('"') == std::string_view::npos ? drd_Word(name) : deck_.texts.Keep(drd_NameOf(name));
}

bool drd_Parser::ParseHeader(std::string_view header, drd_Keyword& keyword) {
    if (!drd_SplitFields(header.substr(1), fields_)) {
        findings_.Add("quote-left-open", keyword.Place(), drd_Shown(header), "a second double quote");
    }
    if (fields_.empty() || fields_[0].empty()) {
        findings_.Add("keyword-without-name", keyword.Place(), drd_Shown(header), "a keyword behind the *");
        return false;
    }
    keyword.word = SpellingOf(fields_[0]);
    parameters_.clear();
    for (std::size_t i = 1; i < fields_.size(); ++i) {
        const std::string_view field = fields_[i];
        if (field.empty()) continue;
        const std::size_t equals = drd_FindOutsideQuotes(field, '=');
        drd_Parameter parameter;
        parameter.word = SpellingOf(drd_Trim(field.substr(0, equals)));
        if (parameter.Key().empty()) {
            findings_.Add("parameter-without-name", keyword.Place(), drd_Shown(field), "NAME=value");
        }
        if (equals != std::string_view::npos) parameter.value = drd_Trim(field.substr(equals + 1));
        parameters_.push_back(parameter);
    }
    const std::span<const drd_Parameter> kept = deck_.texts.Keep(parameters_);
    keyword.firstParameter = kept.data();
    keyword.parameterCount = static_cast<std::uint32_t>(kept.size());
    return true;
}

void drd_Parser::Keyword(std::string_view line) {
    drd_Keyword keyword;
    keyword.header.file = Here().file;
    keyword.header.line = Here().line;
    std::string_view asItStands;
    const std::string_view header = Header(line, asItStands);
    keyword.header.text = asItStands.data();
    keyword.header.length = static_cast<std::uint32_t>(asItStands.size());
    if (!ParseHeader(header, keyword)) return;
    if (keyword.Key() == "include" && options_.followIncludes && Include(keyword)) return;
    AddKeyword(keyword);
}

/// True when the include is done with: its lines come next.
bool drd_Parser::Include(const drd_Keyword& keyword) {
    const std::string name = drd_NameOf(keyword.Value("input"));
    if (name.empty()) {
        findings_.Add("include-without-file", keyword.Place(), "an include without a file", "input=FILE");
        return true;
    }
    const std::filesystem::path folder =
        plt_Path(deck_.files[static_cast<std::size_t>(keyword.Place().file)].name).parent_path();
    OpenFile(folder / plt_Path(name), keyword.Place());
    return true;
}

void drd_Parser::AddKeyword(drd_Keyword& keyword) {
    bulk_ = nullptr;
    keyword.firstLine = deck_.lines.Size();
    keyword.end = static_cast<int>(deck_.keywords.size()) + 1;
    PlaceInBlock(keyword);
    FindOwner(keyword);
    if (keyword.Row() != nullptr && keyword.Row()->defines != drd_KindEnm::NONE) {
        deck_.definitions.Add(static_cast<int>(deck_.keywords.size()));
    }
    deck_.keywords.push_back(keyword);
    BeginData(keyword.word->data);
}

void drd_Parser::BeginData(drd_DataEnm data) {
    switch (data) {
    case drd_DataEnm::LINES:
    case drd_DataEnm::TEXT: break;
    case drd_DataEnm::NODES: BeginNodes(); break;
    case drd_DataEnm::ELEMENTS: BeginElements(); break;
    case drd_DataEnm::NODE_SET: BeginSet(drd_KindEnm::NODE_SET); break;
    case drd_DataEnm::ELEMENT_SET: BeginSet(drd_KindEnm::ELEMENT_SET); break;
    }
}

void drd_Parser::PlaceInBlock(drd_Keyword& keyword) {
    const drd_BlockMark* mark = keyword.word->mark;
    if (mark == nullptr) {
        keyword.block = blockStack_.back();
        return;
    }
    owner_ = -1;
    if (mark->ends) {
        CloseBlock(mark->kind, keyword);
    } else {
        OpenBlock(mark->kind, keyword);
    }
    keyword.block = blockStack_.back();
    if (mark->ends && deck_.blocks[static_cast<std::size_t>(blockStack_.back())].kind == mark->kind)
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
        findings_.Add("end-without-begin", keyword.Place(), drd_Shown("*" + keyword.Name()),
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
    findings_.Add("block-left-open", deck_.keywords[static_cast<std::size_t>(block.begin)].Place(),
                  "the " + std::string(drd_WordOf(block.kind)) + " " +
                      drd_Shown(std::string_view(block.name)) + " has no end",
                  EndWord(block.kind));
}

void drd_Parser::FindOwner(drd_Keyword& keyword) {
    const int index = static_cast<int>(deck_.keywords.size());
    // A keyword that isn't known may be an option as well as not.
    const bool isKnown = keyword.Row() != nullptr;
    drd_Keyword* owner = owner_ < 0 ? nullptr : &deck_.keywords[static_cast<std::size_t>(owner_)];
    const bool isOption = owner != nullptr && (!isKnown || keyword.Row()->IsOptionOf(owner->Row()->owns));
    if (isOption) {
        keyword.parent = owner_;
        owner->end = index + 1;
    } else {
        owner_ = isKnown && keyword.Row()->owns != drd_GroupEnm::NONE ? index : -1;
    }
}
