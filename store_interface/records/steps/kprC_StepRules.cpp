#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalDamping.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StepTimes.h"

#include <cmath>
#include <limits>

namespace {

// The entries of the time incrementation before this one are whole numbers.
constexpr int kIntegerEntries = 11;

/// A deck can be written from whatever the times are: only the solver refuses them.
void CheckTimes(const kprC_AnalysisStep& step, fnd_RecordCheck& report) {
    const kprC_StepTimes times(step);
    const auto expect = [&report](const kprC_TimeField& field, const std::string& what) {
        report.Add("step-times", field.name, "found " + fnd_Shown(field.value), what);
    };
    const auto orLess = [](const kprC_TimeField& field) {
        return std::string(field.name) + " (" + fnd_Shown(field.value) + ") or less";
    };
    const auto& [period, initial, least, most, automatic] = times;
    if (period.IsSet() && period.value <= 0.0) expect(period, "more than 0");
    for (const kprC_TimeField& increment : {initial, least, most}) {
        if (increment.IsSet() && increment.value < 0.0) expect(increment, "0 or more");
    }
    if (!initial.IsSet()) return;
    if (period.IsSet() && period.value > 0.0 && initial.value > period.value) {
        expect(initial, orLess(period));
    }
    if (!automatic) return;
    if (least.IsSet() && least.value > initial.value) expect(least, orLess(initial));
    if (most.IsSet() && most.value < initial.value) expect(initial, orLess(most));
}

/// All plain integers of the record are counts or numbers of something.
void CheckIntegers(const cls_Record& record, fnd_RecordCheck& report) {
    for (const cls_Field& field : record.DynFields().All()) {
        if (field.type->Kind() != cls_FieldKind::Int) continue;
        report.NotNegative(field.name, *static_cast<const int*>(field.In(record)));
    }
}

template <class Record>
void CheckIntegersOf(const Record& record, fnd_RecordCheck& report) {
    CheckIntegers(record, report);
}

void CheckStep(const kprC_Step& step, fnd_RecordCheck& report) {
    if (step.suppressed) {
        report.Add("suppressed-step", "suppressed",
                   "found true, which changes nothing: a suppressed step is written like any other");
    }
}

void CheckAnalysisStep(const kprC_AnalysisStep& step, fnd_RecordCheck& report) {
    CheckTimes(step, report);
    CheckIntegers(step, report);
    if (!step.loadCases.IsEmpty() && !step.AllowLoadCases()) {
        report.Add("load-cases-not-allowed", "loadCases", "found load cases",
                   "none: this procedure allows none");
    }
}

void CheckFrequency(const kprC_FrequencyStep& step, fnd_RecordCheck& report) {
    const int sets = step.residualModeSets.Length();
    const int values = step.residualModeValues.Length();
    if (values > sets) {
        report.Add("list-too-long", "residualModeValues", "found " + std::to_string(values) + " items",
                   "at most " + std::to_string(sets) + ", one for each of residualModeSets");
    }
}

void CheckComplexFrequency(const kprC_ComplexFrequencyStep&, fnd_RecordCheck& report) {
    report.Add("cannot-be-written", "class",
               "found a complex frequency step, of which no deck can be written: writing fails "
               "with \"Unimplemented function to write out *Step card\"");
}

/// The description stands in the deck as it is, below the step's first line.
void CheckDescription(const kprC_Step& step, fnd_RecordCheck& report) {
    std::string_view rest = step.description.View();
    while (!rest.empty()) {
        const std::string_view line = rest.substr(0, rest.find('\n'));
        rest.remove_prefix(std::min(line.size() + 1, rest.size()));
        const std::size_t begin = line.find_first_not_of(" \t");
        if (begin == std::string_view::npos || line[begin] != '*') continue;
        if (line.substr(begin).starts_with("**")) continue;
        report.Add("keyword-in-text", "description",
                   "found the line " + fnd_Quoted(line.substr(0, 60)) + ", which will be read as a keyword");
        return;
    }
}

template <class Range>
void CheckRange(const Range& range, fnd_RecordCheck& report) {
    report.NotNegative("points", range.points);
    if (range.lower > range.upper) {
        report.Add("range-turned", "lower", "found " + fnd_Shown(range.lower),
                   "upper (" + fnd_Shown(range.upper) + ") or less");
    }
}

template <class Row>
void CheckModes(const Row& row, fnd_RecordCheck& report) {
    CheckIntegers(row, report);
    if (row.firstMode > row.lastMode) {
        report.Add("range-turned", "firstMode", "found " + std::to_string(row.firstMode),
                   "lastMode (" + std::to_string(row.lastMode) + ") or less");
    }
}

void CheckMassScaling(const kprC_MassScaling& scaling, fnd_RecordCheck& report) {
    CheckIntegers(scaling, report);
    if (scaling.crossSection != std::trunc(scaling.crossSection)) {
        report.Add("cut-to-integer", "crossSection",
                   "found " + fnd_Shown(scaling.crossSection) + ", which is cut to a whole number");
    }
}

void CheckRestart(const kprC_StandardRestart& restart, fnd_RecordCheck& report) {
    // A negative numberInterval is as good as 0.
    report.NotNegative("frequency", restart.frequency);
}

void CheckControls(const kprC_PrimaryControls& controls, fnd_RecordCheck& report) {
    CheckIntegers(controls, report);
    const int integers = std::min(kIntegerEntries, controls.timeIncrementation.Length());
    for (int i = 0; i < integers; ++i) {
        const double entry = controls.timeIncrementation[i];
        const std::string found = "found " + fnd_Shown(entry) + " as entry " + std::to_string(i);
        if (std::fabs(entry) > std::numeric_limits<int>::max()) {
            report.Add("not-an-integer", "timeIncrementation", found, "a whole number of 32 bits");
        } else if (entry != std::trunc(entry)) {
            report.Add("cut-to-integer", "timeIncrementation", found + ", which is cut to a whole number");
        }
    }
}

/// A list of a field that is longer than its defaults.
void CheckFieldLists(const kprC_PrimaryControls& controls, fnd_RecordCheck& report) {
    const cls_FieldTable& primary = kprC_PrimaryControls::Fields();
    for (const cls_Field& field : controls.DynFields().All()) {
        if (field.defaultItems == nullptr || primary.Find(field.name) != nullptr) continue;
        const int length = static_cast<const cow_List<double>*>(field.In(controls))->Length();
        const int known = field.defaultItems(controls).Length();
        if (length <= known) continue;
        report.Add("list-not-written", field.name, "found " + std::to_string(length) + " entries",
                   "at most " + std::to_string(known) + ": of a longer list nothing is written");
    }
}

} // namespace

void fnd_AddStepRules(fnd_RecordRules& rules) {
    rules.Add<CheckStep>();
    rules.Add<CheckDescription>();
    rules.Add<CheckAnalysisStep>();
    rules.Add<CheckFrequency>();
    rules.Add<CheckComplexFrequency>();
    rules.Add<CheckRange<kprC_RandomResponseFrequency>>();
    rules.Add<CheckRange<kprC_SteadyStateDirectFrequency>>();
    rules.Add<CheckRange<kprC_SteadyStateModalFrequency>>();
    rules.Add<CheckRange<kprC_SteadyStateSubspaceFrequency>>();
    rules.Add<CheckModes<kprC_CompositeDampingRow>>();
    rules.Add<CheckModes<kprC_ModeDampingRow>>();
    rules.Add<CheckModes<kprC_RayleighDampingRow>>();
    rules.Add<CheckMassScaling>();
    rules.Add<CheckRestart>();
    rules.Add<CheckIntegersOf<kprC_ExplicitRestart>>();
    rules.Add<CheckIntegersOf<kprC_Monitor>>();
    rules.Add<CheckIntegersOf<kprC_PerturbationDiagnosticPrint>>();
    rules.Add<CheckIntegersOf<kprC_StandardDiagnosticPrint>>();
    rules.Add<CheckIntegersOf<kprC_LinearCtrl>>();
    rules.Add<CheckControls>();
    rules.Add<CheckFieldLists>();
}
