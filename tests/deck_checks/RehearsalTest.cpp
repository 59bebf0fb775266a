// What makes writing a deck fail though every object is right by itself.
#include "deck_checks/FindingsTest.h"
#include "steps/oif_ProcedureRow.h"

namespace {

/// What writing the model raises, as the finding that foretells it.
Texts Rehearsed(const std::string& members) {
    return FindingsBy([](const odb_Odb& odb, fnd_Sink& sink) { dck_Rehearse(odb, {}, sink); }, members);
}

Texts Fails(const std::string& text, const std::string& where) {
    return {"/models/Default Model: writing fails with \"" + text + "\": " + where};
}

/// A model of one shell whose part has more members, such as sections.
std::string WithPart(const std::string& members, const std::string& more) {
    std::string model = ShellModel(more);
    const std::string lastSet = R"("facets": [[1, "SPOS"]]}]})";
    model.insert(model.find(lastSet) + lastSet.size(), ", " + members);
    return model;
}

} // namespace

TEST(Rehearsal, ModelThatCanBeWritten_HasNothingToTell) {
    EXPECT_EQ(Rehearsed(ShellModel(StepsOf({"Static"}))), Texts{});
}

TEST(SectionFailures, ShellWithoutDataLines_IsToldOfItsSectionWhereElementsHaveIt) {
    const std::string sections =
        StepsOf({"Static"}) + R"(, "sections": {"U": {"class": "kseC_UserShellSection"}})";
    const std::string assignment = R"("sectionAssignments": [{"region": "E", "sectionName": "U"}])";
    EXPECT_EQ(DeckFindings(WithPart(assignment, sections), "/sections/U"),
              Texts{"/sections/U: writing fails with \"Shell general section unimplemented\": parts/P has "
                    "elements of this section"});
    EXPECT_EQ(Rehearsed(WithPart(assignment, sections)), Fails("Shell general section unimplemented", ""));
    EXPECT_EQ(DeckFindings(ShellModel(sections), "/sections/U"), Texts{});
}

TEST(Rehearsal, StepWithoutALine_IsToldByName) {
    EXPECT_EQ(Rehearsed(ShellModel(StepsOf({"ComplexFrequency"}))),
              Fails(oif_kStepLineError, "step 'Step-1'"));
}

TEST(Rehearsal, FailureThatIsToldAlready_IsNotToldAgain) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(R"({"format": "qrx-model/1", "models": {"Default Model": {)" +
                                           ShellModel(StepsOf({"ComplexFrequency"})) + "}}}",
                                       "test", report);
    ASSERT_NE(odb, nullptr);
    std::size_t told = 0;
    for (const fnd_Finding& finding : dck_Check(*odb)) {
        if (finding.code->name == "cannot-be-written") ++told;
    }
    EXPECT_EQ(told, 1U);
}
