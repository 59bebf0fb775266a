#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Kept.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StepTimes.h"

#include <algorithm>
#include <optional>
#include <vector>

namespace {

/// The field of a kind of output; others don't count beside it.
struct OutputField {
    const char* name;
    korC_TypeEnm type;
};
constexpr OutputField kOutputFields[] = {
    {"frequency", korC_TypeEnm::FREQUENCY},        {"numberInterval", korC_TypeEnm::NUMBER_INTERVAL},
    {"timeInterval", korC_TypeEnm::TIME_INTERVAL}, {"modeList", korC_TypeEnm::MODE_LIST},
    {"timePoints", korC_TypeEnm::TIME_POINTS},
};

/// Numbers of states that add to others, or scale what comes from elsewhere.
constexpr std::string_view kNoComponents[] = {"shellThicknessValue", "scaleParameter", "zeroPressureHeight",
                                              "referencePressureHeight"};

/// When the points of an amplitude end; none for a curve without an end, or one that ends at zero: that is
/// how a load is taken away.
std::optional<double> EndOf(const kamC_Amplitude& amplitude) {
    const auto lastOf = [](const cow_2DArray<double>& table) -> std::optional<double> {
        if (table.IsEmpty() || table.NumColumns() < 2) return std::nullopt;
        const int last = table.NumRows() - 1;
        return table.ConstGet(last, 1) == 0.0 ? std::nullopt : std::optional(table.ConstGet(last, 0));
    };
    if (const auto* table = dynamic_cast<const kamC_Tabular*>(&amplitude)) return lastOf(table->table);
    if (const auto* steps = dynamic_cast<const kamC_SmoothStep*>(&amplitude)) return lastOf(steps->table);
    if (const auto* spaced = dynamic_cast<const kamC_EquallySpaced*>(&amplitude)) {
        const int count = spaced->values.Length();
        if (count == 0 || spaced->values[count - 1] == 0.0) return std::nullopt;
        return spaced->begin + spaced->fixedInterval * (count - 1);
    }
    return std::nullopt;
}

/// When a step ends, by its own time and by the time of all steps.
struct Ends {
    double period;
    double total;
};

std::vector<Ends> EndsOf(const kprC_StepContainer& steps) {
    std::vector<Ends> ends;
    double total = 0.0;
    for (int i = 0; i < steps.Size(); ++i) {
        const kprC_StepTimes times(steps.StepAt(i));
        const double period = times.period.IsSet() ? times.period.value : 0.0;
        total += period;
        ends.push_back({period, total});
    }
    return ends;
}

/// What is found in the states that were given.
class StateCheck {
public:
    StateCheck(const odiK_Model& model, fnd_Sink& sink)
        : model_(model), sink_(sink), ends_(EndsOf(model.steps)) {}

    void Run(const kprC_PropagatingObject& object, const fnd_Path& place) {
        if (object.suppressed) return;
        const fnd_Path states(place, "states");
        for (const mdl_GivenState& given : object.GivenStates()) {
            if (given.deactivated || given.status) continue;
            const fnd_Path state(states, given.stepName.View());
            CheckReach(object, given, state);
            CheckOutput(object, given, state);
            CheckAmplitude(given, state);
            CheckComponents(object, given, state);
        }
    }

private:
    void CheckReach(const kprC_PropagatingObject& object, const mdl_GivenState& given,
                    const fnd_Path& place) {
        const mdl_PropagationStatusEnm status = object.StatusIn(given.stepName);
        if (kprC_PropagatingObject::IsActive(status)) return;
        const cow_String word = omu_PrimEnum<mdl_PropagationStatusEnm, 1>(status).GetString();
        sink_.Add("out-of-reach", place,
                  "the object is " + Quoted(word) +
                      " in this step, so nothing of the state stands in the deck");
    }

    void CheckOutput(const kprC_PropagatingObject& object, const mdl_GivenState& given,
                     const fnd_Path& place) {
        const auto* output = dynamic_cast<const korC_Output*>(&object);
        if (output == nullptr) return;
        const korC_TypeEnm type = output->ConstGetState(given.stepName).frequencyType.ConstGet();
        for (const OutputField& field : kOutputFields) {
            if (field.type == type || !given.IsGiven(field.name)) continue;
            sink_.Add("not-in-deck", fnd_Path(place, std::string_view(field.name)),
                      "found a value, and frequencyType is " +
                          Text(omu_PrimEnum<korC_TypeEnm, 1>(type).GetString()) + ", so it doesn't count");
        }
    }

    void CheckAmplitude(const mdl_GivenState& given, const fnd_Path& place) {
        const cls_Record& record = given.record.ConstGet();
        const cls_Field* field = record.DynFields().Find("amplitude");
        if (field == nullptr || !given.IsGiven("amplitude")) return;
        const auto* name = static_cast<const mdl_PropAttr<cow_String>*>(field->In(record));
        const int step = model_.steps.IndexOf(name->ConstGet().IsEmpty() ? cow_String() : given.stepName);
        if (step < 0 || !model_.amplitudes.IsMember(name->ConstGet())) return;
        const kamC_Amplitude& amplitude = model_.amplitudes.ConstGet(name->ConstGet());
        const Ends& ends = ends_[static_cast<std::size_t>(step)];
        const std::optional<double> last = EndOf(amplitude);
        const double needed =
            amplitude.timeSpan == kamC_Amplitude::TimeSpanEnm::TOTAL ? ends.total : ends.period;
        // Times in tables are rounded.
        constexpr double kSlack = 1e-6;
        if (ends.period <= 0.0 || !last || *last >= needed * (1.0 - kSlack)) return;
        sink_.Add("amplitude-too-short", fnd_Path(place, "amplitude"),
                  "found " + Quoted(name->ConstGet()) + ", which ends at " + fnd_Shown(*last),
                  "points up to " + fnd_Shown(needed) + ", the end of the step",
                  "behind its last point it keeps its last value");
    }

    /// Conditions and loads by components: a state that makes the object without any has a keyword and no
    /// line.
    void CheckComponents(const kprC_PropagatingObject& object, const mdl_GivenState& given,
                         const fnd_Path& place) {
        if (object.StatusIn(given.stepName) != mdl_PropagationStatusEnm::CREATED) return;
        if (dynamic_cast<const kbcC_BC*>(&object) == nullptr &&
            dynamic_cast<const kloC_Load*>(&object) == nullptr) {
            return;
        }
        const auto* load = dynamic_cast<const kloC_Load*>(&object);
        if (load != nullptr && load->IsComplex()) return;
        const auto& fields = given.record.ConstGet().DynFields().All();
        bool hasNumbers = false;
        for (std::size_t i = 0; i < fields.size(); ++i) {
            if (fields[i].type != &cls_TypeOf<mdl_PropAttr<double>>::Instance()) continue;
            if (std::ranges::find(kNoComponents, std::string_view(fields[i].name)) != std::end(kNoComponents))
                continue;
            hasNumbers = true;
            if (given.marks[i] != mdl_GivenEnm::ABSENT && given.marks[i] != mdl_GivenEnm::CLEARED) return;
        }
        if (hasNumbers) {
            sink_.Add("no-components", place, "found no component, so the keyword will have no line");
        }
    }

    const odiK_Model& model_;
    fnd_Sink& sink_;
    std::vector<Ends> ends_; // of the steps
};

} // namespace

void dck_CheckStates(const dck_Subject& subject, fnd_Sink& sink) {
    const odiK_Model& model = subject.Model();
    const fnd_Path root;
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!repository.IsPropagating() || !repository.ReachesDeck()) continue;
        const auto findings = subject.Of(std::string("states of ") + repository.member, [&] {
            fnd_List list;
            StateCheck check(model, list);
            const fnd_Path container(root, std::string_view(repository.member));
            for (const auto& [name, record] : repository.In(model)) {
                check.Run(static_cast<const kprC_PropagatingObject&>(record),
                          fnd_Path(container, name.View()));
            }
            return std::move(list.findings);
        });
        for (const fnd_Finding& finding : *findings) sink.Take(finding);
    }
}
