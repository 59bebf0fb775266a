#include "tools/DeckView.h"

#include "deck_reader/drd_Text.h"
#include "model_file/mdf_DeckMesh.h"
#include "store_interface/model/odb_Odb.h"
#include "store_interface/propagation/mdl_PropAttr.h"
#include "tools/DeckCommands.h"

#include <cmath>
#include <map>

using nlohmann::ordered_json;

namespace {

using Status = mdl_PropagationStatusEnm;

/// How a keyword that acts on sets is shown.
struct ShownKeyword {
    std::string_view key;
    const char* kind;
    const char* label;
    const char* mark;
};
constexpr ShownKeyword kShown[] = {
    {"boundary", "boundaryConditions", "Boundary condition", "support"},
    {"connectormotion", "boundaryConditions", "Connector motion", "connector"},
    {"cload", "loads", "Concentrated load", "force"},
    {"dload", "loads", "Distributed load", "spread"},
    {"dsload", "loads", "Surface load", "pressure"},
    {"connectorload", "loads", "Connector load", "connector"},
    {"cflux", "loads", "Concentrated flux", "nodes"},
    {"dflux", "loads", "Body flux", "tint"},
    {"dsflux", "loads", "Surface flux", "tint"},
    {"dsflow", "loads", "Surface flow", "tint"},
    {"fluidflux", "loads", "Fluid flux", "nodes"},
    {"cecharge", "loads", "Concentrated charge", "nodes"},
    {"cecurrent", "loads", "Concentrated current", "nodes"},
    {"decharge", "loads", "Body charge", "tint"},
    {"decurrent", "loads", "Body current", "tint"},
    {"dsecharge", "loads", "Surface charge", "tint"},
    {"dsecurrent", "loads", "Surface current", "tint"},
    {"temperature", "fields", "Temperature", "tint"},
    {"field", "fields", "Field", "tint"},
    {"pressurestress", "fields", "Pressure stress", "tint"},
    {"massflowrate", "fields", "Mass flow rate", "nodes"},
    {"initialconditions", "fields", "Initial condition", "tint"},
    {"cfilm", "interactions", "Film of nodes", "nodes"},
    {"sfilm", "interactions", "Film", "tint"},
    {"cradiate", "interactions", "Radiation of nodes", "nodes"},
    {"sradiate", "interactions", "Radiation", "tint"},
    {"contactpair", "interactions", "Contact pair", "pair"},
    {"tie", "constraints", "Tie", "pair"},
    {"embeddedelement", "constraints", "Embedded elements", "pair"},
    {"shelltosolidcoupling", "constraints", "Shell to solid coupling", "pair"},
    {"coupling", "constraints", "Coupling", "couple"},
    {"rigidbody", "constraints", "Rigid body", "couple"},
    {"equation", "constraints", "Equation", "none"},
};

const ShownKeyword* FindShown(const drd_Keyword& keyword) {
    const auto* found = std::ranges::find(kShown, std::string_view(keyword.key), &ShownKeyword::key);
    return found == std::end(kShown) ? nullptr : found;
}

/// The words of a fixed condition, and the degrees of freedom that they hold.
struct HeldWord {
    std::string_view key;
    const char* dofs;
};
constexpr HeldWord kHeld[] = {{"encastre", "123456"}, {"pinned", "123"}, {"xsymm", "156"},
                              {"ysymm", "246"},       {"zsymm", "345"},  {"xasymm", "234"},
                              {"yasymm", "135"},      {"zasymm", "126"}};

class StoreFiller {
public:
    StoreFiller(const drd_Deck& deck, const drd_Names& names, odiK_Model& model, RunReport& report)
        : deck_(deck), names_(names), model_(model), report_(report) {}

    bool Fill() {
        for (const drd_Block& block : deck_.blocks) {
            if (block.kind == drd_BlockEnm::PART && !AddPart(block)) return false;
        }
        const drd_Mesh* flat = deck_.MeshOf(deck_.blocks.front());
        if (flat != nullptr && !flat->nodes.IsEmpty() && !FillMesh(0, model_.AddPart("Model").mesh))
            return false;
        for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
            if (deck_.blocks[i].kind == drd_BlockEnm::INSTANCE && !AddInstance(static_cast<int>(i)))
                return false;
        }
        AddAssemblySets();
        return true;
    }

private:
    bool FillMesh(int block, cow_CountedHld<odiK_Mesh>& held) {
        const drd_Mesh* mesh = deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(block)]);
        if (mesh == nullptr || mesh->nodes.IsEmpty()) return true;
        held = cow_CountedHld<odiK_Mesh>(new odiK_Mesh());
        fnd_List problems;
        mdf_MeshFileRequest request;
        mdf_MeshOrigin origin;
        const bool good = mdf_DeckMesh(request, origin, problems).FillFrom(deck_, names_, block, *held);
        for (const fnd_Finding& finding : problems.findings) report_.Add(deck_.files.front().name, finding);
        return good && !std::ranges::any_of(problems.findings, &fnd_Finding::IsError);
    }
    bool AddPart(const drd_Block& block) {
        return FillMesh(static_cast<int>(&block - deck_.blocks.data()),
                        model_.AddPart(Name(block.name)).mesh);
    }
    bool AddInstance(int index) {
        const drd_Block& block = deck_.blocks[static_cast<std::size_t>(index)];
        const int part = names_.PartOf(index);
        if (part < 0) {
            report_.Warning(deck_.files.front().name,
                            "the instance " + fnd_Quoted(block.name) + " has no part, and is not shown");
            return true;
        }
        odiK_Instance& instance =
            model_.AddInstance(Name(block.name), Name(deck_.blocks[static_cast<std::size_t>(part)].name));
        Place(block, instance);
        return FillMesh(index, instance.ownMesh);
    }
    /// First moved, then turned about an axis; the store turns about the origin, then moves.
    void Place(const drd_Block& block, odiK_Instance& instance) const {
        drd_Placement placement;
        if (!drd_PlacementOf(deck_, block, placement)) return;
        double axis[3];
        double length = 0.0;
        for (int i = 0; i < 3; ++i) {
            axis[i] = placement.to[i] - placement.from[i];
            length += axis[i] * axis[i];
        }
        length = std::sqrt(length);
        const double radians = placement.degrees * std::acos(-1.0) / 180.0;
        double origin[3];
        placement.Place({0.0, 0.0, 0.0}, origin);
        for (int i = 0; i < 3; ++i) {
            instance.translation[i] = static_cast<float>(origin[i]);
            instance.rotation[i] = length == 0.0 ? 0.0F : static_cast<float>(axis[i] / length * radians);
        }
    }

    void AddAssemblySets() {
        for (std::size_t i = 0; i < names_.Sets().size(); ++i) {
            const drd_Set& set = names_.Sets()[i];
            const bool ofAssembly =
                deck_.blocks[static_cast<std::size_t>(set.block)].kind == drd_BlockEnm::ASSEMBLY;
            if (!ofAssembly || set.name.empty() || set.kind == drd_KindEnm::SURFACE) continue;
            std::vector<drd_Member> members;
            names_.Expand(static_cast<int>(i), members);
            std::map<int, std::vector<int>> labels;
            for (const drd_Member& member : members) labels[member.instance].push_back(member.label);
            std::vector<odiK_MemberInput> inputs;
            for (const auto& [instance, ofInstance] : labels) {
                if (instance >= 0) inputs.push_back({NameOf(instance), ofInstance, {}});
            }
            Add(set.name,
                set.kind == drd_KindEnm::NODE_SET ? res_SetTypeEnm::NODES : res_SetTypeEnm::ELEMENTS,
                set.name.starts_with("_"), inputs);
        }
        for (const drd_Keyword& keyword : deck_.keywords) {
            const bool ofAssembly =
                deck_.blocks[static_cast<std::size_t>(keyword.block)].kind == drd_BlockEnm::ASSEMBLY;
            if (keyword.key == "surface" && ofAssembly) AddSurface(keyword);
        }
    }
    void AddSurface(const drd_Keyword& keyword) {
        if (drd_FoldKey(keyword.Value("type")) == "node") return;
        std::vector<std::string> faces(keyword.lines);
        std::map<int, std::vector<odiK_FacetInput>> facets;
        for (std::uint64_t line = 0; line < keyword.lines; ++line) {
            const std::string_view text = deck_.DataLine(keyword, line);
            const drd_Target target = names_.Find(drd_RefEnm::ELEMENTS, drd_KindEnm::ELEMENT_SET,
                                                  drd_Field(text, 0), keyword.block);
            faces[line] = drd_NameOf(drd_Field(text, 1));
            std::vector<drd_Member> members;
            if (target.set >= 0) names_.Expand(target.set, members);
            if (target.label > 0) members.push_back({target.instance, target.label});
            if (faces[line].empty()) continue;
            for (const drd_Member& member : members)
                facets[member.instance].push_back({member.label, -1, faces[line]});
        }
        std::vector<odiK_MemberInput> inputs;
        for (const auto& [instance, ofInstance] : facets) {
            if (instance >= 0) inputs.push_back({NameOf(instance), {}, ofInstance});
        }
        Add(drd_NameOf(keyword.Value("name")), res_SetTypeEnm::FACETS, false, inputs);
    }
    void Add(const std::string& name, res_SetTypeEnm type, bool internal,
             const std::vector<odiK_MemberInput>& members) {
        if (members.empty() || model_.FindAssemblySet(Name(name)) >= 0) return;
        fnd_List problems;
        model_.AddAssemblySet(Name(name), type, internal, members, problems);
        for (const fnd_Finding& finding : problems.findings) {
            report_.Warning(deck_.files.front().name, "the set " + fnd_Quoted(name) + ": " + finding.Text());
        }
    }

    static cow_String Name(const std::string& name) { return cow_String(std::string_view(name)); }
    cow_String NameOf(int block) const { return Name(deck_.blocks[static_cast<std::size_t>(block)].name); }

    const drd_Deck& deck_;
    const drd_Names& names_;
    odiK_Model& model_;
    RunReport& report_;
};

/// Goes through the deck step by step.
class HeaderFiller {
public:
    HeaderFiller(const drd_Deck& deck, ordered_json& header) : deck_(deck), header_(header) {}

    void Fill() {
        FindSets();
        std::vector<int> steps{-1};
        header_["steps"] =
            ordered_json::array({StepText("Initial", "what stands ahead of all steps", false)});
        for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
            if (deck_.blocks[i].kind != drd_BlockEnm::STEP) continue;
            steps.push_back(static_cast<int>(i));
            AddStep(deck_.blocks[i]);
        }
        for (step_ = 0; step_ < steps.size(); ++step_) ReadStep(steps[step_]);
        header_["objects"] = ordered_json::array();
        for (Object& object : objects_) header_["objects"].push_back(std::move(object.text));
    }

private:
    struct Object {
        const ShownKeyword* shown;
        bool active = false;
        ordered_json text;
    };
    /// What one keyword says of one target: its lines, and what the marks show.
    struct Said {
        std::string text;
        ordered_json state;
    };

    static ordered_json StepText(const std::string& name, const std::string& procedure, bool perturbation) {
        return {{"name", name},
                {"procedure", procedure},
                {"description", ""},
                {"perturbation", perturbation},
                {"loadCases", ordered_json::array()}};
    }
    void AddStep(const drd_Block& block) {
        const drd_Keyword& step = deck_.keywords[static_cast<std::size_t>(block.begin)];
        std::string procedure;
        if (block.begin + 1 < block.last)
            procedure = deck_.keywords[static_cast<std::size_t>(block.begin) + 1].name;
        perturbations_.push_back(step.Find("perturbation") != nullptr);
        header_["steps"].push_back(StepText(block.name, procedure, perturbations_.back()));
        std::string lines;
        for (int i = block.begin; i < std::min(block.begin + 2, block.last); ++i)
            AddKeyword(deck_.keywords[static_cast<std::size_t>(i)], lines);
        header_["steps"].back()["lines"] = lines;
    }

    /// The places of sets in the header by instance (-1: assembly) and folded name.
    void FindSets() {
        const auto add = [this](int instance, const ordered_json& sets) {
            for (std::size_t i = 0; i < sets.size(); ++i) {
                const std::string name = drd_FoldCase(sets[i]["name"].get<std::string>());
                sets_.try_emplace({instance, name}, static_cast<int>(i));
            }
        };
        add(-1, header_["sets"]);
        int place = 0;
        for (const ordered_json& instance : header_["instances"]) {
            instances_[drd_FoldCase(instance["name"].get<std::string>())] = place;
            if (instance["kind"] != "assembly")
                add(place, header_["meshes"][instance["mesh"].get<std::size_t>()]["sets"]);
            ++place;
        }
    }
    void AddRegion(ordered_json& object, std::string_view value, const char* role) const {
        const std::string name = drd_NameOf(value);
        const std::size_t dot = name.find('.');
        int instance = -1;
        std::string set = drd_FoldCase(name);
        if (dot != std::string::npos) {
            const auto found = instances_.find(drd_FoldCase(name.substr(0, dot)));
            if (found == instances_.end()) return;
            instance = found->second;
            set = drd_FoldCase(name.substr(dot + 1));
        } else if (sets_.count({-1, set}) == 0) {
            instance = 0;
        }
        const auto found = sets_.find({instance, set});
        if (found == sets_.end()) return;
        object["regions"].push_back({{"role", role}, {"instance", instance}, {"set", found->second}});
    }

    void ReadStep(int block) {
        std::set<std::size_t> said;
        std::set<std::string_view> renewed;
        const bool isPerturbation = step_ > 0 && perturbations_[step_ - 1];
        for (const drd_Keyword& keyword : deck_.keywords) {
            if (!StandsIn(keyword, block)) continue;
            const ShownKeyword* shown = FindShown(keyword);
            if (shown == nullptr) continue;
            if (drd_FoldKey(keyword.Value("op")) == "new") renewed.insert(shown->key);
            for (auto& [target, what] : SaidBy(keyword)) {
                said.insert(Say(*shown, target, std::move(what), isPerturbation));
            }
        }
        for (std::size_t i = 0; i < objects_.size(); ++i) {
            if (said.count(i) != 0) continue;
            Object& object = objects_[i];
            const bool ends = object.active && renewed.count(object.shown->key) != 0;
            Status status = Status::NO_LONGER_ACTIVE;
            if (ends)
                status = Status::DEACTIVATED;
            else if (object.active)
                status = isPerturbation ? Status::PROPAGATED_FROM_BASE_STATE : Status::PROPAGATED;
            if (ends && !isPerturbation) object.active = false;
            const ordered_json last = object.text["steps"].back();
            object.text["steps"].push_back(
                {static_cast<int>(status), object.active ? last[1] : ordered_json(-1), -1});
        }
    }
    /// Model data stand in no step; load cases belong to theirs.
    bool StandsIn(const drd_Keyword& keyword, int step) const {
        int block = keyword.block;
        while (block >= 0 && deck_.blocks[static_cast<std::size_t>(block)].kind != drd_BlockEnm::STEP) {
            block = deck_.blocks[static_cast<std::size_t>(block)].parent;
        }
        return block == step;
    }

    std::size_t Say(const ShownKeyword& shown, const std::string& target, Said what, bool isPerturbation) {
        const auto [found, isNew] = places_.try_emplace({shown.key, drd_FoldCase(target)}, objects_.size());
        if (isNew) objects_.push_back({&shown, false, ObjectText(shown, target)});
        // Of distributed loads gravity alone says which way it acts.
        if (isNew && shown.key == "dload" && what.state.contains("components"))
            objects_.back().text["mark"] = "gravity";
        Object& object = objects_[found->second];
        ordered_json& steps = object.text["steps"];
        const bool again = steps.size() > step_;
        ordered_json& cards = object.text["cards"];
        if (again) {
            // A further keyword of the step that says something of the same set.
            std::string text = cards.back()[0]["text"];
            cards.back()[0]["text"] = text + what.text;
            Merge(object.text["states"].back(), what.state);
            return found->second;
        }
        cards.push_back(ordered_json::array({{{"loadCase", ""}, {"text", what.text}}}));
        object.text["states"].push_back(std::move(what.state));
        const Status status = object.active ? Status::MODIFIED : Status::CREATED;
        steps.push_back({static_cast<int>(status), static_cast<int>(object.text["states"].size()) - 1,
                         static_cast<int>(cards.size()) - 1});
        if (!isPerturbation) object.active = true;
        return found->second;
    }
    static void Merge(ordered_json& state, const ordered_json& more) {
        if (!more.contains("components") || !state.contains("components")) return;
        for (std::size_t i = 0; i < state["components"].size() && i < more["components"].size(); ++i) {
            const ordered_json& value = more["components"][i];
            if (!value.is_null() && value != 0.0) state["components"][i] = value;
        }
    }
    ordered_json ObjectText(const ShownKeyword& shown, const std::string& target) const {
        ordered_json text = {{"kind", shown.kind},
                             {"name", target.empty() ? shown.label : target},
                             {"class", shown.key},
                             {"label", shown.label},
                             {"doc", "as the deck says it"},
                             {"mark", shown.mark},
                             {"suppressed", false},
                             {"regions", ordered_json::array()},
                             {"fields", ordered_json::array()},
                             {"states", ordered_json::array()},
                             {"cards", ordered_json::array()},
                             {"steps", ordered_json::array()}};
        std::size_t begin = 0;
        const bool isPair = std::string_view(shown.mark) == "pair";
        while (begin <= target.size()) {
            const std::size_t end = std::min(target.find(", ", begin), target.size());
            const bool isFirst = begin == 0;
            const char* role = isFirst ? "region" : "refNode";
            if (isPair) role = isFirst ? "slave" : "master";
            AddRegion(text, std::string_view(target).substr(begin, end - begin), role);
            begin = end + 2;
        }
        for (std::size_t i = 0; i < step_; ++i)
            text["steps"].push_back({static_cast<int>(Status::NOT_YET_ACTIVE), -1, -1});
        return text;
    }

    /// What the keyword says of each target, in the order of its lines.
    std::vector<std::pair<std::string, Said>> SaidBy(const drd_Keyword& keyword) const {
        const std::string head = std::string(deck_.Text(keyword.header)) + "\n";
        std::vector<std::pair<std::string, Said>> all;
        const auto sayOf = [&](const std::string& target) -> Said& {
            for (auto& [name, said] : all) {
                if (drd_FoldCase(name) == drd_FoldCase(target)) return said;
            }
            return all.emplace_back(target, Said{head, {{"fields", ordered_json::array()}}}).second;
        };
        const std::string_view mark = FindShown(keyword)->mark;
        if (mark == "couple") {
            Said& said = sayOf(CoupleOf(keyword));
            AddLines(keyword, said.text);
            const auto place = static_cast<std::size_t>(&keyword - deck_.keywords.data());
            for (std::size_t i = place + 1; i < static_cast<std::size_t>(keyword.end); ++i) {
                AddKeyword(deck_.keywords[i], said.text);
            }
            return all;
        }
        for (std::uint64_t i = 0; i < keyword.lines; ++i) {
            const std::string_view line = deck_.DataLine(keyword, i);
            std::string target = drd_NameOf(drd_Field(line, 0));
            if (mark == "pair") target += ", " + drd_NameOf(drd_Field(line, 1));
            if (mark == "none") target = {};
            Said& said = sayOf(target);
            said.text.append(line).append("\n");
            AddValues(keyword.key, line, said.state);
            AddField(line, mark == "pair" ? 2 : 1, said.state);
        }
        return all;
    }
    void AddKeyword(const drd_Keyword& keyword, std::string& text) const {
        text.append(deck_.Text(keyword.header)).append("\n");
        AddLines(keyword, text);
    }
    void AddLines(const drd_Keyword& keyword, std::string& text) const {
        for (std::uint64_t i = 0; i < keyword.lines; ++i)
            text.append(deck_.DataLine(keyword, i)).append("\n");
    }
    /// The line behind its sets, as the value of a field.
    static void AddField(std::string_view line, std::size_t first, ordered_json& state) {
        constexpr std::size_t most = 6;
        std::string values;
        const auto fields = static_cast<std::size_t>(std::ranges::count(line, ',')) + 1;
        for (std::size_t i = first; i < fields; ++i) {
            const std::string_view field = drd_Field(line, i);
            if (!field.empty()) values.append(values.empty() ? "" : ", ").append(field);
        }
        if (values.empty() || state["fields"].size() >= most) return;
        state["fields"].push_back(
            {{"name", "data"}, {"value", values}, {"doc", "what the line says of the set"}});
    }
    /// The surface and the reference node of a coupling, the elements and the node of a rigid body.
    static std::string CoupleOf(const drd_Keyword& keyword) {
        std::string target;
        for (const char* parameter : {"surface", "elset", "tienset", "pinnset", "refnode"}) {
            const std::string name = drd_NameOf(keyword.Value(parameter));
            if (!name.empty()) target += (target.empty() ? "" : ", ") + name;
        }
        return target;
    }
    static void AddValues(std::string_view key, std::string_view line, ordered_json& state) {
        if (key == "boundary") return AddHeld(line, state);
        double value = 0.0;
        if (key == "dload" && drd_FoldKey(drd_Field(line, 1)) == "grav") {
            if (!drd_ReadReal(drd_Field(line, 2), value)) return;
            state["components"] = ordered_json::array();
            for (std::size_t i = 3; i < 6; ++i) {
                double direction = 0.0;
                drd_ReadReal(drd_Field(line, i), direction);
                state["components"].push_back(value * direction);
            }
        } else if (key == "cload") {
            int dof = 0;
            if (!drd_ReadInt(drd_Field(line, 1), dof) || !drd_ReadReal(drd_Field(line, 2), value)) return;
            if (dof < 1 || dof > 3) return;
            ordered_json& components = state["components"];
            if (components.is_null()) components = {0.0, 0.0, 0.0};
            components[static_cast<std::size_t>(dof - 1)] = value;
        } else if (drd_ReadReal(drd_Field(line, 2), value)) {
            state["magnitude"] = value;
        }
    }
    static void AddHeld(std::string_view line, ordered_json& state) {
        ordered_json& components = state["components"];
        if (components.is_null())
            components = ordered_json::array({nullptr, nullptr, nullptr, nullptr, nullptr, nullptr});
        const auto hold = [&](int dof, double value) {
            if (dof >= 1 && dof <= 6) components[static_cast<std::size_t>(dof - 1)] = value;
        };
        const std::string word = drd_FoldKey(drd_Field(line, 1));
        const auto* held = std::ranges::find(kHeld, std::string_view(word), &HeldWord::key);
        if (held != std::end(kHeld)) {
            for (const char* dof = held->dofs; *dof != '\0'; ++dof) hold(*dof - '0', 0.0);
            return;
        }
        int first = 0;
        if (!drd_ReadInt(drd_Field(line, 1), first)) return;
        int last = first;
        drd_ReadInt(drd_Field(line, 2), last);
        double value = 0.0;
        drd_ReadReal(drd_Field(line, 3), value);
        for (int dof = first; dof <= std::min(last, 6); ++dof) hold(dof, value);
    }

    const drd_Deck& deck_;
    ordered_json& header_;
    std::size_t step_ = 0;
    std::vector<bool> perturbations_;
    std::map<std::pair<int, std::string>, int> sets_;
    std::map<std::string, int> instances_;
    std::vector<Object> objects_;
    std::map<std::pair<std::string_view, std::string>, std::size_t> places_;
};

} // namespace

std::unique_ptr<odb_Odb> StoreOfDeck(const drd_Deck& deck, const drd_Names& names, RunReport& report) {
    auto odb = std::make_unique<odb_Odb>();
    odiK_Model& model = odb->AddModel(odb_Odb::DefaultModelName());
    model.steps.Append("Initial", kprC_InitialStep());
    return StoreFiller(deck, names, model, report).Fill() ? std::move(odb) : nullptr;
}

void DescribeDeck(const drd_Deck& deck, ordered_json& header) {
    HeaderFiller(deck, header).Fill();
}
