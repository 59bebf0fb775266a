#include "deck_reader/drd_Names.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <numeric>

drd_LabelIndex::drd_LabelIndex(const drd_Flat<int>& labels) : labels_(labels) {
    const std::size_t count = labels.Size();
    if (count == 0) return;
    bool isRun = true;
    int greatest = labels[0];
    for (std::size_t i = 1; i < count; ++i) {
        isRun = isRun && labels[i] - 1 == labels[i - 1];
        greatest = std::max(greatest, labels[i]);
    }
    isRun_ = isRun;
    if (isRun) return;
    if (static_cast<std::size_t>(greatest) <= 4 * count + 1000) {
        BuildTable(greatest);
    } else {
        BuildOrder();
    }
}

void drd_LabelIndex::BuildTable(int greatest) {
    table_.assign(static_cast<std::size_t>(greatest) + 1, -1);
    for (std::size_t i = 0; i < labels_.Size(); ++i) {
        std::int32_t& place = table_[static_cast<std::size_t>(labels_[i])];
        if (place < 0) {
            place = static_cast<std::int32_t>(i);
        } else {
            repeated_.push_back(i);
        }
    }
}

void drd_LabelIndex::BuildOrder() {
    ordered_.resize(labels_.Size());
    std::iota(ordered_.begin(), ordered_.end(), 0U);
    std::stable_sort(ordered_.begin(), ordered_.end(),
                     [this](std::uint32_t a, std::uint32_t b) { return labels_[a] < labels_[b]; });
    for (std::size_t i = 1; i < ordered_.size(); ++i) {
        if (labels_[ordered_[i]] == labels_[ordered_[i - 1]]) repeated_.push_back(ordered_[i]);
    }
    std::sort(repeated_.begin(), repeated_.end());
}

std::int64_t drd_LabelIndex::Find(int label) const {
    if (isRun_) {
        const std::int64_t place = std::int64_t{label} - labels_[0];
        return place >= 0 && place < static_cast<std::int64_t>(labels_.Size()) ? place : -1;
    }
    if (!table_.empty()) {
        return label >= 0 && static_cast<std::size_t>(label) < table_.size()
                   ? table_[static_cast<std::size_t>(label)]
                   : -1;
    }
    const auto found =
        std::lower_bound(ordered_.begin(), ordered_.end(), label,
                         [this](std::uint32_t place, int sought) { return labels_[place] < sought; });
    return found != ordered_.end() && labels_[*found] == label ? std::int64_t{*found} : -1;
}

namespace {

/// Names that a part, an instance and the assembly have each for itself.
bool IsScoped(drd_KindEnm kind) {
    return kind == drd_KindEnm::NODE_SET || kind == drd_KindEnm::ELEMENT_SET ||
           kind == drd_KindEnm::SURFACE || kind == drd_KindEnm::ORIENTATION;
}

bool IsSet(drd_KindEnm kind) {
    return kind == drd_KindEnm::NODE_SET || kind == drd_KindEnm::ELEMENT_SET;
}

} // namespace

drd_Names::drd_Names(const drd_Deck& deck)
    : deck_(deck), partOf_(deck.blocks.size(), -1), nodes_(deck.meshes.size()),
      elements_(deck.meshes.size()) {
    for (std::size_t i = 0; i < deck.blocks.size(); ++i) {
        const drd_Block& block = deck.blocks[i];
        if (block.kind == drd_BlockEnm::ASSEMBLY && assembly_ < 0) assembly_ = static_cast<int>(i);
        if (block.kind == drd_BlockEnm::PART)
            parts_.TryEmplace(drd_FoldCase(block.name), static_cast<int>(i));
    }
    for (std::size_t i = 0; i < deck.blocks.size(); ++i) {
        const drd_Block& block = deck.blocks[i];
        if (block.kind != drd_BlockEnm::INSTANCE) continue;
        partOf_[i] = FindPart(deck.keywords[static_cast<std::size_t>(block.begin)].Value("part"));
    }
}

const drd_Names::SetTable& drd_Names::SetNames() const {
    if (sets_ != nullptr) return *sets_;
    sets_ = std::make_unique<SetTable>();
    auto& [sets, parts, index] = *sets_;
    index.Reserve(deck_.setParts.size());
    std::vector<int> setOf;
    setOf.reserve(deck_.setParts.size());
    for (const drd_SetPart& part : deck_.setParts) {
        const auto [place, isNew] = index.TryEmplace(drd_FoldCase(part.name), static_cast<int>(sets.size()),
                                                     drd_ScopeOf(part.kind, part.block));
        if (isNew) sets.push_back({part.kind, part.block, part.name, {}});
        setOf.push_back(place);
    }
    // Each set's end begins as its first place and moves on with every part.
    std::vector<std::size_t> ends(sets.size() + 1, 0);
    for (const int set : setOf) ++ends[static_cast<std::size_t>(set) + 1];
    std::partial_sum(ends.begin(), ends.end(), ends.begin());
    parts.resize(setOf.size());
    for (std::size_t i = 0; i < setOf.size(); ++i) {
        parts[ends[static_cast<std::size_t>(setOf[i])]++] = static_cast<int>(i);
    }
    for (std::size_t i = 0, begin = 0; i < sets.size(); begin = ends[i++]) {
        sets[i].parts = std::span(parts).subspan(begin, ends[i] - begin);
    }
    return *sets_;
}

const drd_Names::DefinitionTable& drd_Names::Definitions() const {
    if (definitions_ != nullptr) return *definitions_;
    definitions_ = std::make_unique<DefinitionTable>();
    definitions_->index.Reserve(deck_.definitions.Size());
    for (const int index : deck_.definitions) {
        const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(index)];
        const std::string name = drd_FoldName(keyword.Value(drd_NameParameter(*keyword.Row())));
        if (name.empty()) continue;
        const drd_KindEnm kind = keyword.Row()->defines;
        // A step may begin as a part ends: blocks are known by the block around them.
        const int block = kind == drd_KindEnm::LOAD_CASE
                              ? deck_.blocks[static_cast<std::size_t>(keyword.block)].parent
                              : (IsScoped(kind) ? keyword.block : -1);
        if (!definitions_->index.TryEmplace(name, index, drd_ScopeOf(kind, block)).second &&
            kind != drd_KindEnm::CONTACT_PAIR && kind != drd_KindEnm::DERIVED) {
            definitions_->twice.push_back(index);
        }
    }
    return *definitions_;
}

const drd_TextMap& drd_Names::Instances() const {
    if (instances_ != nullptr) return *instances_;
    instances_ = std::make_unique<drd_TextMap>();
    int place = -1;
    for (const drd_Block& block : deck_.blocks) {
        ++place;
        if (block.kind == drd_BlockEnm::INSTANCE) instances_->TryEmplace(drd_FoldCase(block.name), place);
    }
    return *instances_;
}

int drd_Names::FindPart(std::string_view value) const {
    return parts_.NumberOr(drd_FoldName(value), -1);
}

int drd_Names::FindInstance(std::string_view name) const {
    return Instances().NumberOr(drd_FoldCase(name), -1);
}

int drd_Names::MeshBlock(int block) const {
    if (deck_.blocks[static_cast<std::size_t>(block)].mesh >= 0) return block;
    const int part = PartOf(block);
    return part >= 0 ? part : block;
}

namespace {

const drd_LabelIndex* LabelsOf(const drd_Deck& deck, int block, drd_Flat<int> drd_Mesh::*labels,
                               std::vector<std::unique_ptr<drd_LabelIndex>>& indices) {
    const int mesh = deck.blocks[static_cast<std::size_t>(block)].mesh;
    if (mesh < 0) return nullptr;
    const auto place = static_cast<std::size_t>(mesh);
    if (indices[place] == nullptr)
        indices[place] = std::make_unique<drd_LabelIndex>(deck.meshes[place].*labels);
    return indices[place].get();
}

} // namespace

const drd_LabelIndex* drd_Names::Nodes(int block) const {
    return LabelsOf(deck_, block, &drd_Mesh::nodes, nodes_);
}

const drd_LabelIndex* drd_Names::Elements(int block) const {
    return LabelsOf(deck_, block, &drd_Mesh::elements, elements_);
}

const int* drd_Names::Indexed(drd_KindEnm kind, std::string_view folded, int block) const {
    const drd_TextMap& index = IsSet(kind) ? SetNames().index : Definitions().index;
    return index.Find(folded, drd_ScopeOf(kind, block));
}

int drd_Names::FindScoped(drd_KindEnm kind, std::string_view folded, int block) const {
    if (const int* found = Indexed(kind, folded, block)) return *found;
    const int part = PartOf(block);
    return part >= 0 ? FindScoped(kind, folded, part) : -1;
}

/// In the assembly and outside all blocks.
int drd_Names::FindAbove(drd_KindEnm kind, std::string_view folded) const {
    const int inAssembly = assembly_ >= 0 ? FindScoped(kind, folded, assembly_) : -1;
    return inAssembly >= 0 ? inAssembly : FindScoped(kind, folded, 0);
}

drd_Target drd_Names::TargetOf(drd_KindEnm kind, int index) const {
    drd_Target target;
    (IsSet(kind) ? target.set : target.keyword) = index;
    return target;
}

drd_Target drd_Names::FindInInstances(drd_KindEnm kind, std::string_view folded) const {
    // Names of instances may have dots too, so that every dot can be the one.
    for (std::size_t dot = folded.find('.'); dot != std::string_view::npos; dot = folded.find('.', dot + 1)) {
        const int* instance = Instances().Find(folded.substr(0, dot));
        if (instance == nullptr) continue;
        const int index = FindScoped(kind, folded.substr(dot + 1), *instance);
        if (index < 0) continue;
        drd_Target target = TargetOf(kind, index);
        target.instance = *instance;
        return target;
    }
    return {};
}

drd_Target drd_Names::Find(drd_KindEnm kind, std::string_view name, int block) const {
    const std::string folded = drd_FoldName(name);
    if (folded.empty()) return {};
    if (!IsScoped(kind)) {
        const int* found = Indexed(kind, folded, -1);
        return found == nullptr ? drd_Target() : TargetOf(kind, *found);
    }
    int index = FindScoped(kind, folded, block);
    const drd_BlockEnm blockKind = deck_.blocks[static_cast<std::size_t>(block)].kind;
    const bool isInside = blockKind == drd_BlockEnm::PART || blockKind == drd_BlockEnm::INSTANCE;
    if (index < 0 && (!isInside || kind == drd_KindEnm::ORIENTATION)) index = FindAbove(kind, folded);
    if (index >= 0) return TargetOf(kind, index);
    return isInside ? drd_Target() : FindInInstances(kind, folded);
}

bool drd_Names::HasLabel(drd_KindEnm kind, int label, int block) const {
    const int meshBlock = MeshBlock(block);
    const drd_LabelIndex* index = kind == drd_KindEnm::NODE_SET ? Nodes(meshBlock) : Elements(meshBlock);
    return index != nullptr && index->Find(label) >= 0;
}

bool drd_Names::FindLabel(drd_KindEnm kind, std::string_view folded, int block, drd_Target& target) const {
    int label = 0;
    if (drd_ReadInt(folded, label)) {
        const drd_BlockEnm blockKind = deck_.blocks[static_cast<std::size_t>(block)].kind;
        const bool isInside = blockKind == drd_BlockEnm::PART || blockKind == drd_BlockEnm::INSTANCE;
        for (const int owner : {block, isInside ? -1 : assembly_, isInside ? -1 : 0}) {
            if (owner < 0 || !HasLabel(kind, label, owner)) continue;
            target.label = label;
            target.block = owner;
            break;
        }
        return true;
    }
    const std::size_t dot = folded.rfind('.');
    if (dot == std::string_view::npos || !drd_ReadInt(folded.substr(dot + 1), label)) return false;
    const int* instance = Instances().Find(folded.substr(0, dot));
    if (instance == nullptr) return false;
    if (HasLabel(kind, label, *instance)) {
        target.label = label;
        target.instance = *instance;
        target.block = *instance;
    }
    return true;
}

drd_Target drd_Names::Find(drd_RefEnm ref, drd_KindEnm kind, std::string_view name, int block) const {
    drd_Target target = Find(kind, name, block);
    if (target) return target;
    switch (ref) {
    case drd_RefEnm::NAME:
    case drd_RefEnm::NAME_UNLESS_NUMBER:
    case drd_RefEnm::NODES_UNLESS_NUMBER: break;
    case drd_RefEnm::NODES:
    case drd_RefEnm::ELEMENTS: FindLabel(kind, drd_FoldName(name), block, target); break;
    case drd_RefEnm::SURFACE_OR_NODES: target = Find(drd_KindEnm::NODE_SET, name, block); break;
    case drd_RefEnm::ELEMENTS_OR_NODES:
        target = Find(drd_KindEnm::ELEMENT_SET, name, block);
        if (!target && !FindLabel(drd_KindEnm::NODE_SET, drd_FoldName(name), block, target)) {
            FindLabel(drd_KindEnm::ELEMENT_SET, drd_FoldName(name), block, target);
        }
        break;
    }
    return target;
}

std::string drd_Names::Nearest(drd_KindEnm kind, std::string_view name) const {
    constexpr std::size_t kTried = 5000;
    drd_Nearest nearest(drd_NameOf(name));
    std::size_t tried = 0;
    const auto tryIn = [&](int block, std::string_view known) {
        const drd_Block& owner = deck_.blocks[static_cast<std::size_t>(block)];
        const std::string whole =
            owner.kind == drd_BlockEnm::INSTANCE ? owner.name + "." + std::string(known) : std::string(known);
        nearest.Try(whole);
        nearest.Try(known, whole);
    };
    if (IsSet(kind)) {
        for (const drd_Set& set : Sets()) {
            if (set.kind == kind && ++tried < kTried) tryIn(set.block, set.name);
        }
        return nearest.Hint();
    }
    for (const drd_Keyword& keyword : deck_.keywords) {
        if (keyword.Row() == nullptr || keyword.Row()->defines != kind || ++tried > kTried) continue;
        const std::string known = drd_NameOf(keyword.Value(drd_NameParameter(*keyword.Row())));
        if (IsScoped(kind)) {
            tryIn(keyword.block, known);
        } else {
            nearest.Try(known);
        }
    }
    return nearest.Hint();
}

bool drd_Names::Expand(int set, std::vector<drd_Member>& members) const {
    members.clear();
    Seen seen;
    const bool isWhole = Collect(set, -1, seen, members);
    std::sort(members.begin(), members.end());
    members.erase(std::unique(members.begin(), members.end()), members.end());
    return isWhole;
}

bool drd_Names::Collect(int set, int instance, Seen& seen, std::vector<drd_Member>& members) const {
    constexpr int kDeepest = 1000;
    if (!seen.sets.emplace(std::int64_t{set} << 32U | static_cast<std::uint32_t>(instance)).second)
        return true;
    if (seen.depth == kDeepest) return false;
    ++seen.depth;
    bool isWhole = true;
    for (const int part : Sets()[static_cast<std::size_t>(set)].parts) {
        isWhole &= CollectPart(deck_.setParts[static_cast<std::size_t>(part)], instance, seen, members);
    }
    --seen.depth;
    return isWhole;
}

void drd_Names::CollectLabels(const drd_SetPart& part, int owner, std::vector<drd_Member>& members) const {
    if (!part.isGenerated) {
        for (const int label : deck_.labels.Part(part.first, part.count)) members.push_back({owner, label});
        return;
    }
    for (std::uint64_t i = part.first; i + 2 < part.first + part.count; i += 3) {
        for (std::int64_t label = deck_.labels[i]; label <= deck_.labels[i + 1];
             label += deck_.labels[i + 2]) {
            members.push_back({owner, static_cast<int>(label)});
        }
    }
}

bool drd_Names::CollectPart(const drd_SetPart& part, int instance, Seen& seen,
                            std::vector<drd_Member>& members) const {
    int owner = instance;
    if (!part.instance.empty()) {
        owner = FindInstance(part.instance);
        if (owner < 0) return false;
    }
    CollectLabels(part, owner, members);
    bool isWhole = CollectFromMesh(part, owner, seen, members);
    for (const drd_Word member : part.members) {
        const int block = part.instance.empty() ? part.block : owner;
        const bool isNodes = part.kind == drd_KindEnm::NODE_SET;
        const drd_Target target =
            Find(isNodes ? drd_RefEnm::NODES : drd_RefEnm::ELEMENTS, part.kind, member, block);
        const int below = target.instance >= 0 ? target.instance : owner;
        if (target.set >= 0) {
            isWhole &= Collect(target.set, below, seen, members);
        } else if (target.label > 0) {
            members.push_back({below, target.label});
        } else {
            isWhole = false;
        }
    }
    return isWhole;
}

/// What nodes and elements put into a set by their own keyword line, and "*Nset, elset=".
bool drd_Names::CollectFromMesh(const drd_SetPart& part, int instance, Seen& seen,
                                std::vector<drd_Member>& members) const {
    if (part.keyword < 0) return true;
    const drd_Keyword& keyword = deck_.keywords[static_cast<std::size_t>(part.keyword)];
    const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(MeshBlock(part.block))]);
    const auto isAhead = [](const auto& run, int of) { return run.keyword < of; };
    if (keyword.Key() == "node" && mesh != nullptr) {
        auto run = std::lower_bound(mesh->nodeRuns.begin(), mesh->nodeRuns.end(), part.keyword, isAhead);
        for (; run != mesh->nodeRuns.end() && run->keyword == part.keyword; ++run) {
            for (const int label : mesh->nodes.Part(run->first, run->count))
                members.push_back({instance, label});
        }
    } else if (keyword.Key() == "element" && mesh != nullptr) {
        auto run =
            std::lower_bound(mesh->elementRuns.begin(), mesh->elementRuns.end(), part.keyword, isAhead);
        for (; run != mesh->elementRuns.end() && run->keyword == part.keyword; ++run) {
            for (const int label : mesh->elements.Part(run->first, run->count))
                members.push_back({instance, label});
        }
    } else if (keyword.Key() == "nset" && keyword.Find("elset") != nullptr) {
        return CollectNodesOfElements(part, instance, seen, members);
    }
    return true;
}

bool drd_Names::CollectNodesOfElements(const drd_SetPart& part, int instance, Seen& seen,
                                       std::vector<drd_Member>& members) const {
    const std::string_view name = deck_.keywords[static_cast<std::size_t>(part.keyword)].Value("elset");
    const drd_Target elements = Find(drd_KindEnm::ELEMENT_SET, name, part.block);
    const int block = MeshBlock(part.block);
    const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
    if (elements.set < 0 || mesh == nullptr) return false;
    std::vector<drd_Member> found;
    const bool isWhole = Collect(elements.set, instance, seen, found);
    for (const drd_Member& element : found) {
        const std::int64_t place = Elements(block)->Find(element.label);
        const auto run = std::upper_bound(
            mesh->elementRuns.begin(), mesh->elementRuns.end(), place,
            [](std::int64_t at, const drd_ElementRun& r) { return at < static_cast<std::int64_t>(r.first); });
        if (place < 0 || run == mesh->elementRuns.begin()) continue;
        const drd_ElementRun& own = *(run - 1);
        const std::uint64_t first = own.firstNode + (static_cast<std::uint64_t>(place) - own.first) *
                                                        static_cast<std::uint64_t>(own.nodes);
        for (const int node : mesh->connectivity.Part(first, static_cast<std::size_t>(own.nodes))) {
            members.push_back({element.instance, node});
        }
    }
    return isWhole;
}

bool drd_Applies(const drd_DataRef& ref, const drd_Keyword& keyword) {
    if (ref.onlyWith.empty()) return true;
    const std::size_t equals = ref.onlyWith.find('=');
    const drd_Parameter* parameter = keyword.Find(ref.onlyWith.substr(0, equals));
    if (parameter == nullptr) return false;
    return equals == std::string_view::npos ||
           drd_FoldKey(parameter->value) == drd_FoldKey(ref.onlyWith.substr(equals + 1));
}

bool drd_Applies(const drd_DataRef& ref, const drd_Keyword& keyword, std::uint64_t line, int column) {
    const auto first = static_cast<std::uint64_t>(ref.firstLine);
    return line >= first && (ref.lineStep > 0 || line == first) && (ref.column < 0 || ref.column == column) &&
           drd_Applies(ref, keyword);
}
