#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <cmath>

const omu_EnumTable& omu_EnumTableOf(bme_ElemLibrary) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", "NONE"}, {1, "STANDARD", "STANDARD"}, {2, "EXPLICIT", "EXPLICIT"}};
    static constexpr omu_EnumTable table{"bme_ElemLibrary", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::DistortionControlEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"}, {1, "YES", "YES"}, {2, "NO", "NO"}};
    static constexpr omu_EnumTable table{"bme_ElemCtrlParams::DistortionControlEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::KinematicSplitEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"},
                                           {1, "AVERAGE_STRAIN", "AVERAGE STRAIN"},
                                           {2, "ORTHOGONAL", "ORTHOGONAL"},
                                           {3, "CENTROID", "CENTROID"}};
    static constexpr omu_EnumTable table{"bme_ElemCtrlParams::KinematicSplitEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::HourglassEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "DEFAULT", "DEFAULT"},     {1, "RELAX_STIFFNESS", "RELAX STIFFNESS"},
        {2, "STIFFNESS", "STIFFNESS"}, {3, "VISCOUS", "VISCOUS"},
        {4, "COMBINED", "COMBINED"},   {5, "ENHANCED", "ENHANCED"}};
    static constexpr omu_EnumTable table{"bme_ElemCtrlParams::HourglassEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::SecondOrderAccuracyEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"}, {1, "YES", "YES"}, {2, "NO", "NO"}};
    static constexpr omu_EnumTable table{"bme_ElemCtrlParams::SecondOrderAccuracyEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(bme_ElemCtrlParams::StressRateEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "DEFAULT", "DEFAULT"}, {1, "JAUMANN", "JAUMANN"}, {2, "SPIN", "SPIN"}};
    static constexpr omu_EnumTable table{"bme_ElemCtrlParams::StressRateEnm", rows};
    return table;
}

bool bme_ElemCtrlParams::IsDefault(bme_ElemLibrary library) const {
    if (library == bme_ElemLibrary::NONE) return true;
    const bme_ElemCtrlParams defaults;
    const auto near = [](double a, double b) { return std::fabs(a - b) <= 1e-6; };
    const bool plain = distortionControl == defaults.distortionControl &&
                       kinematicSplit == defaults.kinematicSplit && hourglass == defaults.hourglass &&
                       secondOrderAccuracy == defaults.secondOrderAccuracy &&
                       stressRate == defaults.stressRate && near(lengthRatio, defaults.lengthRatio) &&
                       near(weightFactor, defaults.weightFactor) &&
                       near(displacementHourglass, defaults.displacementHourglass) &&
                       near(rotationalHourglass, defaults.rotationalHourglass) &&
                       near(outOfPlaneHourglass, defaults.outOfPlaneHourglass) &&
                       near(linearBulkViscosity, defaults.linearBulkViscosity) &&
                       near(quadraticBulkViscosity, defaults.quadraticBulkViscosity);
    if (library == bme_ElemLibrary::EXPLICIT) return plain;
    return plain && hourglassStiffness == 0.0 && bendingHourglassStiffness == 0.0 &&
           drillingHourglassScaling == 0.0;
}

const cls_FieldTable& bme_ElemCtrlParams::Fields() {
    using R = bme_ElemCtrlParams;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::distortionControl>("distortionControl", "whether elements are kept from inverting")
            .Field<&R::lengthRatio>("lengthRatio", "ratio at which distortion control sets in")
            .Unit("no unit")
            .Field<&R::kinematicSplit>("kinematicSplit", "kinematic formulation of hexahedra")
            .Field<&R::hourglass>("hourglass", "kind of hourglass control")
            .Field<&R::secondOrderAccuracy>("secondOrderAccuracy",
                                            "whether large rotations are second-order accurate")
            .Field<&R::stressRate>("stressRate", "objective stress rate")
            .Field<&R::weightFactor>("weightFactor",
                                     "weight of the stiffness part of combined hourglass control")
            .Unit("no unit")
            .Field<&R::displacementHourglass>("displacementHourglass",
                                              "scaling factor of the hourglass control of displacements")
            .Unit("no unit")
            .Field<&R::rotationalHourglass>("rotationalHourglass",
                                            "scaling factor of the hourglass control of rotations")
            .Unit("no unit")
            .Field<&R::outOfPlaneHourglass>("outOfPlaneHourglass",
                                            "scaling factor of the out-of-plane hourglass control")
            .Unit("no unit")
            .Field<&R::linearBulkViscosity>("linearBulkViscosity",
                                            "scaling factor of the linear bulk viscosity")
            .Unit("no unit")
            .Field<&R::quadraticBulkViscosity>("quadraticBulkViscosity",
                                               "scaling factor of the quadratic bulk viscosity")
            .Unit("no unit")
            .Field<&R::hourglassStiffness>("hourglassStiffness",
                                           "hourglass stiffness; zero takes the solver's own")
            .Unit("stress")
            .Field<&R::bendingHourglassStiffness>("bendingHourglassStiffness",
                                                  "hourglass stiffness of the rotations of shells")
            .Unit("stress")
            .Field<&R::drillingHourglassScaling>("drillingHourglassScaling",
                                                 "scaling of the drilling stiffness")
            .Unit("no unit")
            .Example(R"({"hourglass": "ENHANCED"})");
    return fields;
}

void cls_RegisterElementControlRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<bme_ElemCtrlParams>();
}
