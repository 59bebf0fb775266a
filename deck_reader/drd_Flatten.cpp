#include "deck_reader/drd_Flatten.h"

#include "deck_reader/drd_Emitter.h"
#include "deck_reader/drd_FlatNames.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <limits>

namespace {

/// A label that no mesh has may be too great to be shifted; it stays wrong.
int Shifted(int label, int offset) {
    return label > std::numeric_limits<int>::max() - offset ? label : label + offset;
}

class Flattener {
public:
    Flattener(const drd_Deck& deck, qio_ostream& device, drd_Findings& findings)
        : deck_(deck), findings_(findings), names_(deck), flat_(deck, names_), emitter_(device) {}
    void Run();

private:
    /// Where a keyword is written: as it stands in the deck, or as a part of an instance.
    struct Place {
        int instance = -1;
        drd_Placement placement = {};
    };

    void NameAll();
    void Table();
    void Walk();
    void Instance(int block);
    void Comments(int keyword);
    void Keyword(int index, const Place& place);
    bool IsDropped(const drd_Keyword& keyword) const;
    bool IsLocal(int block) const;
    std::vector<drd_Parameter> Parameters(const drd_Keyword& keyword, const Place& place, bool& changed);
    std::string FlatReference(drd_RefEnm ref, drd_KindEnm kind, std::string_view value, int block,
                              int instance);
    void Data(const drd_Keyword& keyword, const Place& place);
    std::string DataLine(const drd_Keyword& keyword, std::uint64_t line, const Place& place);
    bool Turned(const drd_Keyword& keyword, std::uint64_t line, const Place& place, std::string& text);
    std::string TurnedPoints(std::string_view line, const drd_Placement& placement, bool arePoints) const;
    void Nodes(const drd_Keyword& keyword, int index, const Place& place);
    void Elements(int index, const Place& place);
    void Set(const drd_Keyword& keyword, const Place& place);
    void CheckExpressible(const drd_Keyword& keyword, const Place& place);

    const drd_Deck& deck_;
    drd_Findings& findings_;
    drd_Names names_;
    drd_FlatNames flat_;
    drd_Emitter emitter_;
    std::vector<char> isWritten_; // keywords of parts that stand once for all instances
    std::size_t comment_ = 0;
    std::vector<int> labels_;
    drd_Texts values_; // of the keyword that is being written
};

bool Flattener::IsLocal(int block) const {
    const drd_BlockEnm kind = deck_.blocks[static_cast<std::size_t>(block)].kind;
    return kind == drd_BlockEnm::PART || kind == drd_BlockEnm::INSTANCE;
}

void Flattener::Run() {
    if (!flat_.HasRoom()) {
        findings_.Add("flat-labels-run-out", {}, "the labels of all instances", "at most 2147483647");
        return;
    }
    isWritten_.assign(deck_.keywords.size(), 0);
    NameAll();
    Table();
    Walk();
}

/// Gives every set, surface and system of an instance its flat name, in the order of the deck.
void Flattener::NameAll() {
    for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
        if (deck_.blocks[i].kind != drd_BlockEnm::INSTANCE) continue;
        const int instance = static_cast<int>(i);
        for (const int block : {names_.PartOf(instance), instance}) {
            if (block < 0) continue;
            const drd_Block& of = deck_.blocks[static_cast<std::size_t>(block)];
            for (int k = of.begin; k < of.last; ++k) {
                const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(k)];
                if (keyword.set >= 0) {
                    flat_.NameIn(instance, deck_.setParts[static_cast<std::size_t>(keyword.set)].name);
                } else if (keyword.IsBulk()) {
                    const std::string_view own = keyword.Value(keyword.Key() == "node" ? "nset" : "elset");
                    if (!own.empty()) flat_.NameIn(instance, drd_NameOf(own));
                } else if (keyword.Key() == "surface" || keyword.Key() == "orientation") {
                    flat_.NameIn(instance, drd_NameOf(keyword.Value("name")));
                }
            }
        }
    }
}

void Flattener::Table() {
    for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
        if (deck_.blocks[i].kind != drd_BlockEnm::INSTANCE) continue;
        const int block = static_cast<int>(i);
        emitter_.Line("** Instance " + deck_.blocks[i].name + ": labels of nodes + " +
                      std::to_string(flat_.NodeOffset(block)) + ", of elements + " +
                      std::to_string(flat_.ElementOffset(block)));
    }
    for (const drd_FlatNames::Renamed& renamed : flat_.Table()) {
        emitter_.Line("** " + renamed.from + " became " + renamed.to);
    }
}

bool Flattener::IsDropped(const drd_Keyword& keyword) const {
    return keyword.Key() == "assembly" || keyword.Key() == "endassembly" || keyword.Key() == "endinstance" ||
           keyword.Key() == "part" || keyword.Key() == "endpart" || keyword.Key() == "instance";
}

void Flattener::Comments(int keyword) {
    for (; comment_ < deck_.comments.Size() && deck_.comments[comment_].keyword <= keyword; ++comment_) {
        // Those of parts are gone where the part is.
        const int owner = deck_.comments[comment_].keyword;
        const bool isInPart =
            owner >= 0 &&
            deck_.blocks[static_cast<std::size_t>(deck_.keywords[static_cast<std::size_t>(owner)].block)]
                    .kind == drd_BlockEnm::PART;
        if (!isInPart) emitter_.Line(deck_.Text(deck_.comments[comment_].text));
    }
}

void Flattener::Walk() {
    Comments(-1);
    std::vector<char> isUsed(deck_.blocks.size(), 0);
    for (std::size_t i = 0; i < deck_.keywords.size(); ++i) {
        const drd_Keyword& keyword = deck_.keywords[i];
        const drd_Block& block = deck_.blocks[static_cast<std::size_t>(keyword.block)];
        const int index = static_cast<int>(i);
        if (block.kind == drd_BlockEnm::INSTANCE) {
            if (block.begin == index) {
                Instance(keyword.block);
                const int part = names_.PartOf(keyword.block);
                if (part >= 0) isUsed[static_cast<std::size_t>(part)] = 1;
            }
            continue;
        }
        if (block.kind != drd_BlockEnm::PART && !IsDropped(keyword)) Keyword(index, {});
        Comments(index);
    }
    for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
        const drd_Block& block = deck_.blocks[i];
        if (block.kind != drd_BlockEnm::PART || isUsed[i] != 0) continue;
        findings_.Add("flat-left-out", deck_.keywords[static_cast<std::size_t>(block.begin)].Place(),
                      "the part " + drd_Shown(std::string_view(block.name)) + " has no instance");
    }
}

void Flattener::Instance(int block) {
    const drd_Block& instance = deck_.blocks[static_cast<std::size_t>(block)];
    Place place;
    place.instance = block;
    if (!drd_PlacementOf(deck_, instance, place.placement)) {
        findings_.Add("placement-wrong", deck_.keywords[static_cast<std::size_t>(instance.begin)].Place(),
                      "the lines of the instance " + drd_Shown(std::string_view(instance.name)));
    }
    emitter_.Line("** Instance " + instance.name);
    const int part = names_.PartOf(block);
    if (part >= 0) {
        const drd_Block& of = deck_.blocks[static_cast<std::size_t>(part)];
        for (int i = of.begin; i < of.last; ++i) {
            const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(i)];
            if (keyword.block == part && !IsDropped(keyword)) Keyword(i, place);
        }
    }
    for (int i = instance.begin; i < instance.last; ++i) {
        const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(i)];
        if (keyword.block == block && !IsDropped(keyword)) Keyword(i, place);
        Comments(i);
    }
}

void Flattener::CheckExpressible(const drd_Keyword& keyword, const Place& place) {
    const bool isTurned = place.placement.degrees != 0.0;
    if (keyword.Row() == nullptr) {
        findings_.Add("flat-as-it-stands", keyword.Place(), drd_Shown("*" + keyword.Name()));
    }
    if (keyword.Key() == "node" && keyword.Find("system") != nullptr) {
        findings_.Add("flat-left-out", keyword.Place(), "nodes in a system of their own", {},
                      "their coordinates are taken for rectangular ones");
    }
    if (isTurned && keyword.Key() == "rotaryi" && keyword.Find("orientation") == nullptr) {
        findings_.Add("flat-left-out", keyword.Place(), "the inertia of a turned instance has no orientation",
                      {}, "its axes are taken for those of the assembly");
    }
    const bool hasDirections =
        keyword.Key() == "equation" || keyword.Key() == "cload" || keyword.Key() == "boundary";
    if (isTurned && hasDirections) {
        findings_.Add("flat-as-it-stands", keyword.Place(),
                      drd_Shown("*" + keyword.Name()) + " of a turned instance names directions");
    }
}

void Flattener::Keyword(int index, const Place& place) {
    const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(index)];
    if (place.instance >= 0) {
        CheckExpressible(keyword, place);
        // What has one name in the whole deck is written with the first instance.
        const bool isShared = keyword.Row() != nullptr && keyword.Row()->defines != drd_KindEnm::NONE &&
                              keyword.Key() != "surface" && keyword.Key() != "orientation";
        char& written = isWritten_[static_cast<std::size_t>(index)];
        if (isShared && written != 0) return;
        written = 1;
    }
    bool changed = false;
    const std::vector<drd_Parameter> parameters = Parameters(keyword, place, changed);
    if (changed) {
        emitter_.Keyword(keyword.Name(), parameters);
    } else {
        emitter_.Line(deck_.Text(keyword.header));
    }
    if (keyword.Key() == "node" && keyword.IsBulk()) {
        Nodes(keyword, index, place);
    } else if (keyword.Key() == "element" && keyword.IsBulk()) {
        Elements(index, place);
    } else if (keyword.set >= 0) {
        Set(keyword, place);
    } else {
        Data(keyword, place);
    }
}

std::vector<drd_Parameter> Flattener::Parameters(const drd_Keyword& keyword, const Place& place,
                                                 bool& changed) {
    std::vector<drd_Parameter> parameters(keyword.Parameters().begin(), keyword.Parameters().end());
    values_.Clear();
    const bool isSet = keyword.Key() == "nset" || keyword.Key() == "elset";
    const bool namesItself = keyword.Key() == "surface" || keyword.Key() == "orientation";
    for (drd_Parameter& parameter : parameters) {
        const bool isOwnName = (namesItself && parameter.Key() == "name") ||
                               (isSet && parameter.Key() == keyword.Key()) ||
                               (keyword.Key() == "node" && parameter.Key() == "nset") ||
                               (keyword.Key() == "element" && parameter.Key() == "elset");
        std::string value = parameter.value;
        if (isOwnName) {
            if (place.instance >= 0) value = flat_.NameIn(place.instance, drd_NameOf(parameter.value));
        } else {
            for (const drd_ParameterRef& ref : parameter.word->parameterRefs) {
                if (!drd_Applies(ref, keyword)) continue;
                value = FlatReference(ref.ref, ref.kind, parameter.value, keyword.block, place.instance);
            }
        }
        if (value == parameter.value) continue;
        changed = true;
        parameter.value = values_.Keep(value);
    }
    const std::size_t before = parameters.size();
    if (isSet) std::erase_if(parameters, [](const drd_Parameter& p) { return p.Key() == "instance"; });
    changed = changed || parameters.size() != before;
    return parameters;
}

/// The name or label in the flat deck; the value itself where nothing changes.
std::string Flattener::FlatReference(drd_RefEnm ref, drd_KindEnm kind, std::string_view value, int block,
                                     int instance) {
    std::string same(value);
    double number = 0.0;
    const bool isNumber = drd_ReadReal(value, number);
    if (isNumber && (ref == drd_RefEnm::NAME_UNLESS_NUMBER || ref == drd_RefEnm::NODES_UNLESS_NUMBER))
        return same;
    const int seenFrom = instance >= 0 ? instance : block;
    const drd_Target target = names_.Find(ref, kind, value, seenFrom);
    const int owner = target.instance >= 0 ? target.instance : instance;
    if (target.set >= 0) {
        const drd_Set& set = names_.Sets()[static_cast<std::size_t>(target.set)];
        return IsLocal(set.block) && owner >= 0 ? flat_.NameIn(owner, set.name) : same;
    }
    if (target.keyword >= 0) {
        const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(target.keyword)];
        const bool isLocal = (kind == drd_KindEnm::SURFACE || kind == drd_KindEnm::ORIENTATION) &&
                             owner >= 0 && IsLocal(keyword.block);
        return isLocal ? flat_.NameIn(owner, drd_NameOf(keyword.Value("name"))) : same;
    }
    if (target.label <= 0) return same;
    const int offsetOf = owner >= 0 ? owner : (IsLocal(block) ? block : 0);
    const bool isNode = kind == drd_KindEnm::NODE_SET;
    return std::to_string(target.label +
                          (isNode ? flat_.NodeOffset(offsetOf) : flat_.ElementOffset(offsetOf)));
}

void Flattener::Data(const drd_Keyword& keyword, const Place& place) {
    for (std::uint64_t line = 0; line < keyword.lines; ++line) emitter_.Line(DataLine(keyword, line, place));
}

std::string Flattener::DataLine(const drd_Keyword& keyword, std::uint64_t line, const Place& place) {
    const std::string_view text = deck_.DataLine(keyword, line);
    std::string turned;
    if (Turned(keyword, line, place, turned)) return turned;
    const std::span<const drd_DataRef> refs = keyword.word->dataRefs;
    if (refs.empty() || (keyword.Key() == "equation" && drd_Field(text, 1).empty())) return std::string(text);
    // Fields are replaced in place; all else stays as it stands.
    std::string result;
    std::size_t begin = 0;
    bool changed = false;
    for (int column = 0; begin <= text.size(); ++column) {
        const std::size_t length = drd_FindOutsideQuotes(text.substr(begin), ',');
        const std::string_view field = text.substr(begin, length);
        const std::string_view value = drd_Trim(field);
        std::string flat(value);
        for (const drd_DataRef& ref : refs) {
            if (value.empty() || !drd_Applies(ref, keyword, line, column)) continue;
            flat = FlatReference(ref.ref, ref.kind, value, keyword.block, place.instance);
        }
        changed = changed || flat != value;
        const std::size_t blanks =
            value.empty() ? field.size() : static_cast<std::size_t>(value.data() - field.data());
        result.append(field.substr(0, blanks)).append(flat);
        if (!value.empty()) result.append(field.substr(blanks + value.size()));
        if (length == std::string_view::npos) break;
        result.push_back(',');
        begin += length + 1;
    }
    return changed ? result : std::string(text);
}

/// Lines of points and directions, for a placed instance.
bool Flattener::Turned(const drd_Keyword& keyword, std::uint64_t line, const Place& place,
                       std::string& text) {
    if (place.instance < 0 || place.placement.IsNone()) return false;
    const std::string_view data = deck_.DataLine(keyword, line);
    if (keyword.Key() == "transform" || keyword.Key() == "orientation") {
        if (line != 0 || drd_Trim(data).empty()) return false;
        const std::string system =
            drd_FoldKey(keyword.Value(keyword.Key() == "transform" ? "type" : "system"));
        const bool isRound = system.starts_with("c") || system.starts_with("s");
        // With an origin of its own a rectangular system is given by points; else by directions from the
        // origin.
        text = TurnedPoints(data, place.placement, isRound || !drd_Field(data, 6).empty());
        return true;
    }
    const bool isBeam = keyword.Key() == "beamsection" || keyword.Key() == "beamgeneralsection";
    if (isBeam && line >= 1 && place.placement.degrees != 0.0) {
        // The direction is the line of three numbers behind the profile's, which an open profile has several
        // of.
        std::vector<std::string_view> fields;
        drd_SplitFields(data, fields);
        const bool isArbitrary = drd_FoldKey(keyword.Value("section")) == "arbitrary";
        const bool isDirection = fields.size() == 3 && (!isArbitrary || line + 1 == keyword.lines);
        if (!isDirection) return false;
        text = TurnedPoints(data, place.placement, false);
        return true;
    }
    return false;
}

std::string Flattener::TurnedPoints(std::string_view line, const drd_Placement& placement,
                                    bool arePoints) const {
    constexpr int kDigits = 15;
    std::vector<std::string_view> fields;
    drd_SplitFields(line, fields);
    std::string text;
    for (std::size_t i = 0; i < fields.size(); i += 3) {
        double point[3] = {0.0, 0.0, 0.0};
        double placed[3];
        for (std::size_t k = 0; k < 3 && i + k < fields.size(); ++k) drd_ReadReal(fields[i + k], point[k]);
        if (arePoints) {
            placement.Place(point, placed);
        } else {
            placement.Turn(point, placed);
        }
        for (const double value : placed)
            text += (text.empty() ? "" : ", ") + drd_Emitter::Real(value, kDigits);
    }
    return text;
}

void Flattener::Nodes(const drd_Keyword& keyword, int index, const Place& place) {
    const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(keyword.block)]);
    const int block = place.instance >= 0 ? place.instance : keyword.block;
    const int offset = flat_.NodeOffset(block);
    auto run = std::lower_bound(mesh->nodeRuns.begin(), mesh->nodeRuns.end(), index,
                                [](const drd_NodeRun& r, int of) { return r.keyword < of; });
    for (; run != mesh->nodeRuns.end() && run->keyword == index; ++run) {
        for (std::uint64_t i = run->first; i < run->first + run->count; ++i) {
            const double* at = mesh->coordinates.Data() + 3 * i;
            const double point[3] = {at[0], at[1], at[2]};
            double placed[3] = {at[0], at[1], at[2]};
            if (!place.placement.IsNone()) place.placement.Place(point, placed);
            emitter_.Node(Shifted(mesh->nodes[i], offset), placed);
        }
    }
}

void Flattener::Elements(int index, const Place& place) {
    const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(index)];
    const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(keyword.block)]);
    const int block = place.instance >= 0 ? place.instance : keyword.block;
    auto run = std::lower_bound(mesh->elementRuns.begin(), mesh->elementRuns.end(), index,
                                [](const drd_ElementRun& r, int of) { return r.keyword < of; });
    for (; run != mesh->elementRuns.end() && run->keyword == index; ++run) {
        const auto nodes = static_cast<std::uint64_t>(run->nodes);
        labels_.resize(nodes);
        for (std::uint64_t i = 0; i < run->count; ++i) {
            for (std::uint64_t n = 0; n < nodes; ++n) {
                const std::uint64_t at = run->firstNode + i * nodes + n;
                int owner = block;
                if (!mesh->owners.IsEmpty() && mesh->owners[at] >= 0) {
                    owner = names_.FindInstance(deck_.owners[static_cast<std::size_t>(mesh->owners[at])]);
                }
                labels_[n] = Shifted(mesh->connectivity[at], owner >= 0 ? flat_.NodeOffset(owner) : 0);
            }
            emitter_.Element(Shifted(mesh->elements[run->first + i], flat_.ElementOffset(block)), labels_);
        }
    }
}

void Flattener::Set(const drd_Keyword& keyword, const Place& place) {
    const drd_SetPart& part = deck_.setParts[static_cast<std::size_t>(keyword.set)];
    int owner = place.instance >= 0 ? place.instance : keyword.block;
    if (!part.instance.empty()) owner = names_.FindInstance(part.instance);
    const bool isNodes = part.kind == drd_KindEnm::NODE_SET;
    const int offset = owner < 0 ? 0 : (isNodes ? flat_.NodeOffset(owner) : flat_.ElementOffset(owner));
    const std::span<const int> labels = deck_.labels.Part(part.first, part.count);
    labels_.assign(labels.begin(), labels.end());
    for (std::size_t i = 0; i < labels_.size(); ++i) {
        if (!part.isGenerated || i % 3 != 2) labels_[i] = Shifted(labels_[i], offset);
    }
    if (part.isGenerated) {
        for (std::size_t i = 0; i + 2 < labels_.size(); i += 3)
            emitter_.Labels(std::span(labels_).subspan(i, 3));
    } else {
        emitter_.Labels(labels_);
    }
    const int instance = part.instance.empty() ? place.instance : owner;
    for (const drd_Word member : part.members) {
        emitter_.Member(FlatReference(isNodes ? drd_RefEnm::NODES : drd_RefEnm::ELEMENTS, part.kind, member,
                                      keyword.block, instance));
    }
}

} // namespace

void drd_Flatten(const drd_Deck& deck, qio_ostream& device, drd_Findings& findings) {
    Flattener(deck, device, findings).Run();
}
