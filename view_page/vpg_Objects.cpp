#include "view_page/vpg_Objects.h"

#include "conditions/oif_BCTable.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/propagation/mdl_StatusWords.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/steps/kprC_StepTimes.h"
#include "store_interface/records/steps/kprC_StepWords.h"
#include "view_page/vpg_Marks.h"
#include "view_page/vpg_Values.h"

using nlohmann::ordered_json;

namespace {

ordered_json StatusesText() {
    ordered_json statuses = ordered_json::array();
    for (const omu_EnumRow& row : omu_EnumTableOf(mdl_PropagationStatusEnm()).rows) {
        const auto status = static_cast<mdl_PropagationStatusEnm>(row.value);
        statuses.push_back({{"name", row.name},
                            {"words", mdl_StatusWords(row.name)},
                            {"active", kprC_PropagatingObject::IsActive(status)}});
    }
    return statuses;
}

ordered_json StepsText(const kprC_StepContainer& steps, const oif_DeckLines& lines) {
    ordered_json texts = ordered_json::array();
    for (int i = 0; i < steps.Size(); ++i) {
        const kprC_Step& step = steps.StepAt(i);
        const kprC_StepTimes times(step);
        ordered_json text = {{"name", vpg_Text(steps.NameAt(i))},
                             {"procedure", kprC_ProcedureWords(step)},
                             {"description", vpg_Text(step.description)},
                             {"perturbation", step.Perturbation()},
                             {"loadCases", ordered_json::array()}};
        if (times.period.IsSet()) text["period"] = times.period.value;
        for (const oif_ObjectLines& own : lines.Of("steps", steps.NameAt(i), steps.NameAt(i)))
            if (own.loadCase.IsEmpty()) text["lines"] = vpg_Text(cow_String(own.text));
        if (const auto* analysis = nex_canDynamicCastPtr<kprC_AnalysisStep>(&step)) {
            for (const auto& [name, loadCase] : analysis->loadCases)
                text["loadCases"].push_back(vpg_Text(name));
        }
        texts.push_back(std::move(text));
    }
    return texts;
}

ordered_json DatumsText(const std::vector<odiK_Datum>& datums) {
    const auto triple = [](const auto& v) { return ordered_json{v.X(), v.Y(), v.Z()}; };
    const auto name = [](const auto& value) {
        return omu_EnumTableOf(value).Row(static_cast<int>(value))->name;
    };
    ordered_json texts = ordered_json::array();
    for (const odiK_Datum& datum : datums) {
        texts.push_back({{"name", vpg_Text(datum.name)},
                         {"type", name(datum.type)},
                         {"system", name(datum.csysType)},
                         {"origin", triple(datum.origin)},
                         {"axes", {triple(datum.xAxis), triple(datum.yAxis), triple(datum.zAxis)}}});
    }
    return texts;
}

/// What comments of decks call the class, else what the class is for.
std::string LabelOf(unsigned typeId) {
    if (const oif_LoadRow* load = oif_FindLoadRow(typeId)) return load->label;
    if (const oif_BCRow* bc = oif_FindBCRow(typeId)) return bc->label;
    if (const oif_FieldRow* field = oif_FindFieldRow(typeId)) return field->label;
    std::string words;
    for (const char c : cls_Classes().Find(typeId)->info.Word()) {
        const bool isCapital = c >= 'A' && c <= 'Z';
        if (isCapital && !words.empty()) words += ' ';
        words += isCapital && !words.empty() ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return words;
}

/// One object on its way to the header. States that steps share stand once.
class ObjectText {
public:
    ObjectText(const vpg_Layout& layout, const oif_DeckLines& lines, const odiK_Repository& repository,
               const cow_String& name, const cls_Record& object)
        : layout_(layout), lines_(lines), repository_(repository), name_(name), object_(object),
          default_(cls_Classes().Find(object.DynTypeId())->create()) {}

    ordered_json Make() {
        const unsigned typeId = object_.DynTypeId();
        text_ = {{"kind", repository_.member},
                 {"name", vpg_Text(name_)},
                 {"class", vpg_Text(cls_Classes().ShortNameOf(typeId))},
                 {"label", LabelOf(typeId)},
                 {"doc", cls_Classes().Find(typeId)->info.doc},
                 {"mark", vpg_MarkOf(typeId)}};
        text_.update(vpg_MarkFrameOf(object_));
        text_["fields"] = vpg_FieldsOf(object_, *default_);
        AddRegions();
        text_["states"] = ordered_json::array();
        text_["cards"] = ordered_json::array();
        text_["steps"] = ordered_json::array();
        const kprC_StepContainer& steps = layout_.Model().steps;
        const auto* propagating = dynamic_cast<const kprC_PropagatingObject*>(&object_);
        text_["suppressed"] = propagating != nullptr && propagating->suppressed;
        const int constraintCard = propagating == nullptr && steps.Size() > 0 ? CardOf(steps.NameAt(0)) : -1;
        for (const auto& [step, record] : steps) {
            if (propagating == nullptr) {
                text_["steps"].push_back({-1, -1, constraintCard});
            } else {
                text_["steps"].push_back(
                    {static_cast<int>(propagating->StatusIn(step)), StateOf(step, record), CardOf(step)});
            }
        }
        return std::move(text_);
    }

private:
    void AddRegion(const std::string& role, const ordered_json& region) {
        if (region.is_null()) return;
        ordered_json text = {{"role", role}};
        text.update(region);
        text_["regions"].push_back(std::move(text));
    }
    void AddRegions() {
        text_["regions"] = ordered_json::array();
        vpg_ForEachRegion(object_, [&](const std::string& role, const rgnC_Region& region) {
            AddRegion(role, layout_.RegionOf(region));
        });
        const auto addSet = [&](const std::string& role, const cow_String& set) {
            const int place = layout_.Model().FindAssemblySet(set);
            if (place >= 0) AddRegion(role, {{"instance", -1}, {"set", place}});
        };
        if (const auto* equation = nex_canDynamicCastPtr<kcoC_Equation>(&object_)) {
            for (const kcoC_EquationTerm& term : equation->terms) addSet("terms", term.setName);
        }
        if (const auto* motion = nex_canDynamicCastPtr<kbcC_ConnectorBC>(&object_)) {
            for (const cow_String& connector : motion->connectors) addSet("connectors", connector);
        }
    }

    /// The place of a text in a list of different ones.
    int PlaceIn(const char* list, ordered_json entry) {
        ordered_json& entries = text_[list];
        // The last one is the likeliest.
        for (std::size_t i = entries.size(); i > 0; --i) {
            if (entries[i - 1] == entry) return static_cast<int>(i - 1);
        }
        entries.push_back(std::move(entry));
        return static_cast<int>(entries.size()) - 1;
    }
    template <class T>
    ordered_json StateText(const T& object, const cow_String& step, const kprC_Step& record) {
        const auto& quad = object.ConstGetStateQuad(step);
        if (!quad.hasState) return nullptr;
        const std::unique_ptr<cls_Record> none(object.NewState(record.ProcedureType()));
        const bool sameClass = none->DynTypeId() == quad.state.ConstGet().DynTypeId();
        ordered_json state = {
            {"fields", sameClass ? vpg_FieldsOf(quad.state.ConstGet(), *none) : ordered_json::array()}};
        if constexpr (requires { vpg_MarkStateOf(object, step); }) {
            const ordered_json mark = vpg_MarkStateOf(object, step);
            if (!mark.is_null()) state.update(mark);
        }
        return state;
    }
    int StateOf(const cow_String& step, const kprC_Step& record) {
        ordered_json state;
        if (const auto* bc = nex_canDynamicCastPtr<kbcC_BC>(&object_)) state = StateText(*bc, step, record);
        if (const auto* load = nex_canDynamicCastPtr<kloC_Load>(&object_))
            state = StateText(*load, step, record);
        if (const auto* field = nex_canDynamicCastPtr<kpfC_Field>(&object_)) {
            state = StateText(*field, step, record);
        }
        if (const auto* interaction = nex_canDynamicCastPtr<kinC_Interaction>(&object_)) {
            state = StateText(*interaction, step, record);
        }
        return state.is_null() ? -1 : PlaceIn("states", std::move(state));
    }
    int CardOf(const cow_String& step) {
        ordered_json card = ordered_json::array();
        for (const oif_ObjectLines& lines : lines_.Of(repository_.member, name_, step)) {
            card.push_back({{"loadCase", vpg_Text(lines.loadCase)}, {"text", lines.text}});
        }
        return card.empty() ? -1 : PlaceIn("cards", std::move(card));
    }

    const vpg_Layout& layout_;
    const oif_DeckLines& lines_;
    const odiK_Repository& repository_;
    const cow_String& name_;
    const cls_Record& object_;
    std::unique_ptr<cls_Record> default_;
    ordered_json text_;
};

} // namespace

void vpg_DescribeObjects(const vpg_Layout& layout, const oif_DeckLines& lines, ordered_json& header) {
    header["statuses"] = StatusesText();
    header["steps"] = StepsText(layout.Model().steps, lines);
    header["datums"] = DatumsText(layout.Model().Datums());
    ordered_json& objects = header["objects"] = ordered_json::array();
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.IsInOrder() || !oif_DeckLines::Knows(repository.member)) continue;
        for (const auto& [name, object] : repository.In(layout.Model())) {
            objects.push_back(ObjectText(layout, lines, repository, name, object).Make());
        }
    }
}
