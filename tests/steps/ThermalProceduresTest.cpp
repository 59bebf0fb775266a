#include "ProcedureCases.h"
#include "steps/oif_ThermalProcedures.h"

namespace {

using Increments = kprC_Step::TimeIncrementationEnm;
using Response = kprC_Step::ResponseEnm;
using Heat = kprC_HeatTransferStep;
using Electric = kprC_CoupledThermalElectricStep;
using Diffusion = kprC_MassDiffusionStep;
using Coupled = kprC_CoupledTempDisplacementStep;

} // namespace

TEST(HeatTransfer, Parameters_FollowTheRecord) {
    ExpectTexts<oif_HeatTransfer, Heat>({
        {"defaults", [](Heat&) {}, "*Heat Transfer, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n"},
        {"end at a rate",
         [](Heat& s) {
             s.end = 0.5;
             s.deltmx = 10.0;
         },
         "*Heat Transfer, end=SS, deltmx=10.\n1., 1., 1e-05, 1., 0.5\n"},
        {"end at rate zero", [](Heat& s) { s.end = 0.0; },
         "*Heat Transfer, end=SS, deltmx=0.\n1., 1., 1e-05, 1., 0.\n"},
        {"response of no known kind", [](Heat& s) { s.response = Response{2}; },
         "*Heat Transfer, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n"},
        {"emissivity change", [](Heat& s) { s.mxdem = 0.2; },
         "*Heat Transfer, end=PERIOD, deltmx=0., mxdem=0.2\n1., 1., 1e-05, 1., \n"},
        {"steady state",
         [](Heat& s) {
             s.response = Response::STEADY_STATE;
             s.initialInc = 0.25;
             s.mxdem = 0.0;
         },
         "*Heat Transfer, steady state, deltmx=0., mxdem=0.\n0.25, 1., 1e-05, 1., \n"},
        {"steady state with a rate",
         [](Heat& s) {
             s.response = Response::STEADY_STATE;
             s.end = 4.0;
         },
         "*Heat Transfer, steady state, deltmx=0.\n1., 1., 1e-05, 1., 4.\n"},
        {"fixed increments", [](Heat& s) { s.timeIncrementationMethod = Increments::DIRECT; },
         "*Heat Transfer, end=PERIOD\n1., 1., , ,\n"},
        {"fixed increments with a rate",
         [](Heat& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 4.0;
         },
         "*Heat Transfer, end=SS\n1., 1., , ,4.\n"},
    });
}

TEST(HeatTransfer, SteadyStateWithFixedIncrements_RepeatsTheIncrementOnPurpose) {
    ExpectTexts<oif_HeatTransfer, Heat>({
        {"without a rate",
         [](Heat& s) {
             s.response = Response::STEADY_STATE;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.initialInc = 0.5;
             s.timePeriod = 2.0;
         },
         "*Heat Transfer, steady state\n0.5, 2., 0.5, 0.5, \n"},
        {"with a rate",
         [](Heat& s) {
             s.response = Response::STEADY_STATE;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 3.0;
         },
         "*Heat Transfer, steady state\n1., 1., 1., 1., 3.\n"},
    });
}

TEST(HeatTransfer, EmissivityChangeWithFixedIncrements_IsWritten) {
    Heat record;
    record.timeIncrementationMethod = Increments::DIRECT;
    record.mxdem = 0.2;
    EXPECT_EQ(Written(oif_HeatTransfer(record)), "*Heat Transfer, end=PERIOD, mxdem=0.2\n1., 1., , ,\n");
}

TEST(CoupledThermalElectric, Parameters_FollowTheRecord) {
    ExpectTexts<oif_CoupledThermalElectric, Electric>({
        {"defaults", [](Electric&) {},
         "*Coupled Thermal-Electrical, end=PERIOD, deltmx=0.\n1., 1., 1e-05, 1., \n"},
        {"end at a rate",
         [](Electric& s) {
             s.end = 0.5;
             s.deltmx = 10.0;
             s.mxdem = 0.2;
         },
         "*Coupled Thermal-Electrical, end=SS, deltmx=10., mxdem=0.2\n1., 1., 1e-05, 1., 0.5\n"},
        {"steady state", [](Electric& s) { s.response = Response::STEADY_STATE; },
         "*Coupled Thermal-Electrical, steady state, deltmx=0.\n1., 1., 1e-05, 1., \n"},
        {"fixed increments with a rate",
         [](Electric& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 0.5;
         },
         "*Coupled Thermal-Electrical, end=SS\n1., 1., , ,0.5\n"},
    });
}

TEST(CoupledThermalElectric, EmissivityChangeWithFixedIncrements_IsLeftOutOnPurpose) {
    Electric record;
    record.timeIncrementationMethod = Increments::DIRECT;
    record.mxdem = 0.2;
    EXPECT_EQ(Written(oif_CoupledThermalElectric(record)),
              "*Coupled Thermal-Electrical, end=PERIOD\n1., 1., , ,\n");
}

TEST(CoupledThermalElectric, SteadyStateWithFixedIncrements_HasNoBounds) {
    Electric record;
    record.timeIncrementationMethod = Increments::DIRECT;
    record.response = Response::STEADY_STATE;
    EXPECT_EQ(Written(oif_CoupledThermalElectric(record)),
              "*Coupled Thermal-Electrical, steady state\n1., 1., , ,\n");
}

TEST(MassDiffusion, Parameters_FollowTheRecord) {
    ExpectTexts<oif_MassDiffusion, Diffusion>({
        {"defaults", [](Diffusion&) {}, "*Mass Diffusion, end=PERIOD, dcmax=0.\n1., 1., 1e-05, 1., \n"},
        {"end at a rate",
         [](Diffusion& s) {
             s.end = 0.2;
             s.dcmax = 7.0;
         },
         "*Mass Diffusion, end=SS, dcmax=7.\n1., 1., 1e-05, 1., 0.2\n"},
        {"fixed increments",
         [](Diffusion& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.dcmax = 7.0;
         },
         "*Mass Diffusion, end=PERIOD\n1., 1., , ,\n"},
        {"fixed increments with a rate",
         [](Diffusion& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 0.2;
         },
         "*Mass Diffusion, end=SS\n1., 1., , ,0.2\n"},
        {"steady state", [](Diffusion& s) { s.response = Response::STEADY_STATE; },
         "*Mass Diffusion, steady state\n1., 1., 1e-05, 1., \n"},
        {"steady state, fixed, with a rate",
         [](Diffusion& s) {
             s.response = Response::STEADY_STATE;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 0.2;
         },
         "*Mass Diffusion, steady state\n1., 1., , ,0.2\n"},
    });
}

TEST(MassDiffusion, RateZeroIsNoneButTheUnsetOneIsARateOnPurpose) {
    Diffusion record;
    record.end = cls_UnsetDouble;
    EXPECT_EQ(Written(oif_MassDiffusion(record)),
              "*Mass Diffusion, end=SS, dcmax=0.\n1., 1., 1e-05, 1., 1.79769e+308\n");
}

TEST(CoupledTempDisplacement, Parameters_FollowTheRecord) {
    const std::vector<ProcedureCase<Coupled>> cases = {
        {"defaults", [](Coupled&) {}, "*Coupled Temperature-Displacement\n1., 1., 1e-05, 1.\n"},
        {"no creep",
         [](Coupled& s) {
             s.creep = Coupled::CreepEnm::NONE;
             s.cetol = 0.01;
         },
         "*Coupled Temperature-Displacement, creep=none\n1., 1., 1e-05, 1.\n"},
        {"explicit creep",
         [](Coupled& s) {
             s.creep = Coupled::CreepEnm::EXPLICIT;
             s.cetol = 0.01;
         },
         "*Coupled Temperature-Displacement, creep=explicit, cetol=0.01\n1., 1., 1e-05, 1.\n"},
        {"both tolerances",
         [](Coupled& s) {
             s.deltmx = 5.0;
             s.cetol = 0.01;
         },
         "*Coupled Temperature-Displacement, deltmx=5., cetol=0.01\n1., 1., 1e-05, 1.\n"},
        {"tolerances below zero",
         [](Coupled& s) {
             s.deltmx = -5.0;
             s.cetol = -0.01;
         },
         "*Coupled Temperature-Displacement\n1., 1., 1e-05, 1.\n"},
        {"steady state",
         [](Coupled& s) {
             s.response = Response::STEADY_STATE;
             s.deltmx = 5.0;
             s.cetol = 0.01;
         },
         "*Coupled Temperature-Displacement, steady state\n1., 1., 1e-05, 1.\n"},
        {"fixed increments",
         [](Coupled& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.deltmx = 5.0;
             s.cetol = 0.01;
         },
         "*Coupled Temperature-Displacement\n1., 1., \n"},
        {"steady state, fixed and stabilized by a factor",
         [](Coupled& s) {
             s.response = Response::STEADY_STATE;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.stabilizationMethod = Coupled::StabilizationMethodEnm{2};
         },
         "*Coupled Temperature-Displacement, steady state, stabilize, factor=0.0002\n1., 1., \n"},
        {"stabilized by energy",
         [](Coupled& s) { s.stabilizationMethod = Coupled::StabilizationMethodEnm{1}; },
         "*Coupled Temperature-Displacement, stabilize=0.0002\n1., 1., 1e-05, 1.\n"},
    };
    ExpectTexts(cases, [](const Coupled& record) { return oif_CoupledTempDisplacement(record, true); });
}

TEST(CoupledTempDisplacement, OtherFormat_WordsCreepDifferently) {
    const std::vector<ProcedureCase<Coupled>> cases = {
        {"no creep", [](Coupled& s) { s.creep = Coupled::CreepEnm::NONE; },
         "*Coupled Temperature-Displacement, no creep\n1., 1., 1e-05, 1.\n"},
        {"explicit creep", [](Coupled& s) { s.creep = Coupled::CreepEnm::EXPLICIT; },
         "*Coupled Temperature-Displacement, explicit\n1., 1., 1e-05, 1.\n"},
    };
    ExpectTexts(cases, [](const Coupled& record) { return oif_CoupledTempDisplacement(record, false); });
}
