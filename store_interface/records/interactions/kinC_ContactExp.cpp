#include "store_interface/records/interactions/kinC_ContactExp.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"

cow_List<rgnC_Region> kinC_ContactExp::ContactSurfaces() const {
    cow_List<rgnC_Region> surfaces;
    for (const auto* pairs : {&inclusionPairs, &exclusionPairs, &propertyAssignmentPairs,
                              &surfacePropertyAssignmentPairs, &formulationAssignmentPairs}) {
        for (int i = 0; i < pairs->Length(); ++i) {
            surfaces.Append((*pairs)[i].first);
            surfaces.Append((*pairs)[i].second);
        }
    }
    return surfaces;
}

const cls_FieldTable& kinC_SurfacePair::Fields() {
    using R = kinC_SurfacePair;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::first>("first", "first surface; not set: printed as an empty name (all exterior)")
            .Field<&R::second>(
                "second",
                "second surface; not set: printed as an empty name; unused by surface property assignments")
            .Example(R"({"first": "PART-1.TOP", "second": "PART-2.BOTTOM"})");
    return fields;
}

const cls_FieldTable& kinC_SurfThick::Fields() {
    using R = kinC_SurfThick;
    static constexpr cls_IntMeaning typeMeanings[] = {{0, "ORIG, original thickness"},
                                                      {1, "the number in value (any value but 0 and 3)"},
                                                      {3, "CURR, current thickness"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::type>("type", "which thickness")
            .Meanings(typeMeanings)
            .Field<&R::value>("value", "thickness, where type says that it is a number")
            .Unit("length")
            .Field<&R::scale>("scale", "scale factor on the thickness")
            .Unit("no unit")
            .Example(R"({"type": "ORIG", "scale": 0.9})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kinC_MasterSlave::MasterSlaveEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "MASTER", "MASTER"}, {1, "SLAVE", "SLAVE"}, {2, "BALANCED", "BALANCED"}};
    static constexpr omu_EnumTable table{"kinC_MasterSlave::MasterSlaveEnm", rows};
    return table;
}

const cls_FieldTable& kinC_MasterSlave::Fields() {
    using R = kinC_MasterSlave;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::masterSlave>("masterSlave", "the role; reaches the deck as its text")
            .Example(R"({"masterSlave": "SLAVE"})");
    return fields;
}

const cls_FieldTable& kinC_ContactExpState::Fields() {
    using R = kinC_ContactExpState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::wholeModelContact>("wholeModelContact",
                                          "true: the whole exterior of the model is included")
            .Field<&R::inclusions>("inclusions",
                                   "per inclusion pair: true writes the pair; or the pairs themselves")
            .Field<&R::exclusions>("exclusions",
                                   "per exclusion pair: true writes the pair; or the pairs themselves")
            .Field<&R::propertyAssignments>("propertyAssignments",
                                            "per property assignment: the contact property; an entry that "
                                            "was never set is not written; or the pairs with it, in one")
            .RefersTo<kinC_ContactProperty>("interactionProperty")
            .Field<&R::surfacePropertyAssignments>(
                "surfacePropertyAssignments", "per surface property assignment: the thickness; an entry that "
                                              "was never set is not written; or the pairs with it, in one")
            .Field<&R::formulationAssignments>("formulationAssignments",
                                               "per formulation assignment: the role; an entry that was "
                                               "never set is not written; or the pairs with it, in one")
            .Example(R"({"wholeModelContact": true, "propertyAssignments": [{"property": "Friction"}]})");
    return fields;
}

const cls_FieldTable& kinC_ContactExp::Fields() {
    using R = kinC_ContactExp;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::inclusionPairs>("inclusionPairs", "pairs that may come into contact")
            .Field<&R::exclusionPairs>("exclusionPairs", "pairs left out of contact")
            .Field<&R::propertyAssignmentPairs>("propertyAssignmentPairs",
                                                "pairs with a contact property of their own")
            .Field<&R::surfacePropertyAssignmentPairs>(
                "surfacePropertyAssignmentPairs",
                "surfaces (first of each entry) with a thickness of their own")
            .Field<&R::formulationAssignmentPairs>("formulationAssignmentPairs",
                                                   "pairs with a master-slave role of their own");
    return fields;
}

void cls_RegisterGeneralContactRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_SurfacePair>();
    registrar.Add<kinC_SurfThick>();
    registrar.Add<kinC_MasterSlave>();
    registrar.Add<kinC_ContactExpState>();
    registrar.Add<kinC_ContactExp>();
}
