#include "store_interface/records/steps/kprC_Controls.h"

#include "store_interface/records/cls_ClassRegistrar.h"

#include <span>

namespace {

cow_List<double> ListOf(std::span<const double> values) {
    cow_List<double> list;
    for (const double value : values) list.Append(value);
    return list;
}

cow_List<double> DefaultTimeIncrementationItems(const kprC_PrimaryControls& controls) {
    return kprC_PrimaryControls::timeIncrementationDef(controls.discontinuous);
}

cow_List<double> DefaultConstraintsItems(const cls_Record&) {
    return kprC_PrimaryControls::constraintsDef();
}

cow_List<double> DefaultLineSearchItems(const cls_Record&) {
    return kprC_PrimaryControls::lineSearchDef();
}

cow_List<double> DefaultDisplacementItems(const cls_Record&) {
    return kprC_PrimaryControls::fieldDef(true);
}

cow_List<double> DefaultFieldItems(const cls_Record&) {
    return kprC_PrimaryControls::fieldDef(false);
}

} // namespace

cow_List<double> kprC_PrimaryControls::timeIncrementationDef(bool discontinuous) {
    static constexpr double values[] = {4.0,  8.0,  9.0,  16.0, 10.0, 4.0,  12.0, 5.0,  6.0,
                                        3.0,  50.0, 0.25, 0.5,  0.75, 0.85, 0.25, 0.25, 1.5,
                                        0.75, 0.8,  1.5,  1.25, 2.0,  0.95, 0.1,  1.0,  0.95};
    cow_List<double> list = ListOf(values);
    if (discontinuous) {
        // The residuals are watched later: they may grow at first.
        list.Get(0) = 8.0;
        list.Get(1) = 10.0;
    }
    return list;
}

cow_List<double> kprC_PrimaryControls::constraintsDef() {
    static constexpr double values[] = {1e-05, 1e-05, 1e-05, 1e-05, 0.005, 0.1, 1e-05, 1e-05, 1.0};
    return ListOf(values);
}

cow_List<double> kprC_PrimaryControls::lineSearchDef() {
    static constexpr double values[] = {0.0, 1.0, 0.0001, 0.25, 0.1};
    return ListOf(values);
}

cow_List<double> kprC_PrimaryControls::fieldDef(bool displacement) {
    static constexpr double values[] = {0.005, 0.01, 0.0, 0.0, 0.02, 1e-05, 0.001, 1e-08, 1.0, 1e-05, 1e-08};
    // The last one, for zero displacement increments, belongs to displacements only.
    const std::span<const double> all(values);
    return ListOf(displacement ? all : all.first(all.size() - 1));
}

const cls_FieldTable& kprC_PrimaryControls::Fields() {
    using R = kprC_PrimaryControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_Controls::Fields())
            .Field<&R::useDefault>("useDefault", "true: nothing at all is written, not even the comment")
            .Field<&R::resetOnly>("resetOnly", "true: the controls are reset and nothing else")
            .Field<&R::discontinuous>("discontinuous", "settings for a severely discontinuous response")
            .Field<&R::timeIncrementation>("timeIncrementation",
                                           "parameters of time incrementation in the solver's order, up to "
                                           "27, the first 11 whole numbers")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultTimeIncrementationItems>()
            .Field<&R::constraints>("constraints", "tolerances of constraints in the solver's order, up to 9")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultConstraintsItems>()
            .Field<&R::lineSearch>("lineSearch",
                                   "parameters of the line search in the solver's order, up to 5")
            .Unit("no unit")
            .DefaultItems<DefaultLineSearchItems>()
            .Field<&R::quasiNewtonMaxIterations>(
                "quasiNewtonMaxIterations",
                "line search iterations of the quasi-Newton technique; stored, never written")
            .NotInDeck("lineSearch has the iterations");
    return fields;
}

const cls_FieldTable& kprC_TypicalControls::Fields() {
    using R = kprC_TypicalControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_PrimaryControls::Fields())
            .Field<&R::displacement>("displacement",
                                     "tolerances of the displacement field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultDisplacementItems>()
            .Field<&R::hydrostaticFluidPressure>(
                "hydrostaticFluidPressure",
                "tolerances of the hydrostatic fluid pressure field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Field<&R::rotation>("rotation", "tolerances of the rotation field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_HeatTransferControls::Fields() {
    using R = kprC_HeatTransferControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_PrimaryControls::Fields())
            .Field<&R::temperature>("temperature",
                                    "tolerances of the temperature field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_MassDiffusionControls::Fields() {
    using R = kprC_MassDiffusionControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_PrimaryControls::Fields())
            .Field<&R::concentration>("concentration",
                                      "tolerances of the concentration field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_CTDControls::Fields() {
    using R = kprC_CTDControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_TypicalControls::Fields())
            .Field<&R::temperature>("temperature",
                                    "tolerances of the temperature field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_PoreControls::Fields() {
    using R = kprC_PoreControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_TypicalControls::Fields())
            .Field<&R::poreFluidPressure>("poreFluidPressure",
                                          "tolerances of the pore fluid pressure field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_ElectricalControls::Fields() {
    using R = kprC_ElectricalControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_TypicalControls::Fields())
            .Field<&R::electricalPotential>(
                "electricalPotential", "tolerances of the electrical potential field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_CTEControls::Fields() {
    using R = kprC_CTEControls;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_HeatTransferControls::Fields())
            .Field<&R::electricalPotential>(
                "electricalPotential", "tolerances of the electrical potential field in the solver's order")
            .Unit("as the solver's manual says")
            .DefaultItems<DefaultFieldItems>()
            .Example(R"({"lineSearch": [4]})");
    return fields;
}

const cls_FieldTable& kprC_LinearCtrl::Fields() {
    using R = kprC_LinearCtrl;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::useDefault>("useDefault", "true: nothing at all is written, not even the comment")
            .Field<&R::resetOnly>("resetOnly", "true: only '*Solver Controls, reset'")
            .Field<&R::relativeTolerance>("relativeTolerance",
                                          "relative convergence tolerance; zero is not written")
            .Unit("no unit")
            .Field<&R::maxIterations>("maxIterations", "largest number of iterations; zero is not written")
            .Example(R"({"relativeTolerance": 1e-4})");
    return fields;
}

void cls_RegisterStepControlRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_Controls>();
    registrar.Add<kprC_PrimaryControls>();
    registrar.Add<kprC_TypicalControls>();
    registrar.Add<kprC_HeatTransferControls>();
    registrar.Add<kprC_MassDiffusionControls>();
    registrar.Add<kprC_CTDControls>();
    registrar.Add<kprC_PoreControls>();
    registrar.Add<kprC_ElectricalControls>();
    registrar.Add<kprC_CTEControls>();
    registrar.Add<kprC_LinearCtrl>();
}
