#include "store_interface/records/output/karC_RemeshingRule.h"

const omu_EnumTable& omu_EnumTableOf(karC_RemeshingRule::OutputFrequencyEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "LAST_INCREMENT", "LAST INCREMENT"},
                                           {1, "ALL_INCREMENTS", "ALL INCREMENTS"}};
    static constexpr omu_EnumTable table{"karC_RemeshingRule::OutputFrequencyEnm", rows};
    return table;
}

cls_xpListString karC_RemeshingRule::GetFullVariableList() const {
    struct Indicator {
        const char* name;
        const char* restsOn;
    };
    static constexpr Indicator indicators[] = {
        {"ENDENERI", "ENDEN"}, {"MISESERI", "MISESAVG"}, {"PEEQERI", "PEEQAVG"}, {"PEERI", "PEAVG"},
        {"CEERI", "CEAVG"},    {"HFLERI", "HFLAVG"},     {"EFLERI", "EFLAVG"},   {"EPGERI", "EPGAVG"}};
    cls_xpListString names;
    const auto append = [&names](const cow_String& name) {
        for (int i = 0; i < names.Length(); ++i) {
            if (names[i] == name) return;
        }
        names.Append(name);
    };
    for (int i = 0; i < variables.Length(); ++i) {
        for (const Indicator& indicator : indicators) {
            if (variables[i] == indicator.name) append(indicator.restsOn);
        }
        append(variables[i]);
    }
    return names;
}

const cls_FieldTable& karC_RemeshingRule::Fields() {
    using R = karC_RemeshingRule;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::description>("description", "free text")
            .FreeText()
            .Field<&R::suppressed>("suppressed",
                                   "a suppressed rule gives no output and its step doesn't count")
            .Field<&R::stepName>("stepName", "the step that works the indicators out")
            .RefersTo("step")
            .Field<&R::region>("region", "region of the rule; none for the whole model")
            .Field<&R::fieldOutput>("fieldOutput", "whether field output of the indicators is wanted")
            .Field<&R::outputFrequency>("outputFrequency", "in the last increment or in all")
            .Field<&R::variables>("variables", "the error indicators")
            .Example(R"({"stepName": "Step-1"})");
    return fields;
}
