#include "ProcedureCases.h"
#include "steps/oif_StaticProcedures.h"

namespace {

using Increments = kprC_Step::TimeIncrementationEnm;
using Static = kprC_StaticStep;
using Riks = kprC_StaticRiksStep;
using Soils = kprC_SoilsStep;
using Visco = kprC_ViscoStep;
using Buckle = kprC_BuckleStep;

oif_StaticRiks RiksOn(const Riks& record) {
    return {record, "I.\"a b\""};
}

} // namespace

TEST(Static, Parameters_FollowTheRecord) {
    ExpectTexts<oif_Static, Static>({
        {"defaults", [](Static&) {}, "*Static\n1., 1., 1e-05, 1.\n"},
        {"all increments",
         [](Static& s) {
             s.initialInc = 0.1;
             s.timePeriod = 2.5;
             s.minInc = 1e-8;
             s.maxInc = 0.5;
         },
         "*Static\n0.1, 2.5, 1e-08, 0.5\n"},
        {"adiabatic", [](Static& s) { s.adiabatic = true; }, "*Static, adiabatic\n1., 1., 1e-05, 1.\n"},
        {"no stop of automatic increments", [](Static& s) { s.noStop = true; },
         "*Static\n1., 1., 1e-05, 1.\n"},
        {"fully plastic, as it stands", [](Static& s) { s.fullyPlastic = "Bar-1.a b"; },
         "*Static, fully plastic=Bar-1.a b\n1., 1., 1e-05, 1.\n"},
        {"stabilized by energy", [](Static& s) { s.stabilizationMethod = Static::StabilizationEnm{1}; },
         "*Static, stabilize=0.0002\n1., 1., 1e-05, 1.\n"},
        {"stabilized by a factor",
         [](Static& s) {
             s.stabilizationMethod = Static::StabilizationEnm{2};
             s.stabilizationMagnitude = 3.0;
         },
         "*Static, stabilize, factor=3.\n1., 1., 1e-05, 1.\n"},
        {"stabilized in no known way", [](Static& s) { s.stabilizationMethod = Static::StabilizationEnm{3}; },
         "*Static\n1., 1., 1e-05, 1.\n"},
        {"increments of no known kind", [](Static& s) { s.timeIncrementationMethod = Increments{2}; },
         "*Static\n1., 1., \n"},
        {"everything",
         [](Static& s) {
             s.adiabatic = true;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.fullyPlastic = "P";
             s.stabilizationMethod = Static::StabilizationEnm{1};
             s.stabilizationMagnitude = 0.0;
         },
         "*Static, adiabatic, direct, fully plastic=P, stabilize=0.\n1., 1., \n"},
    });
}

TEST(Static, DirectIncrements_EndTheDataLineInASeparatorOnPurpose) {
    ExpectTexts<oif_Static, Static>({
        {"direct", [](Static& s) { s.timeIncrementationMethod = Increments::DIRECT; },
         "*Static, direct\n1., 1., \n"},
        {"direct without a stop",
         [](Static& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.noStop = true;
             s.initialInc = 0.25;
         },
         "*Static, direct=NO STOP\n0.25, 1., \n"},
    });
}

TEST(Static, ParameterBehindALongName_StandsOnTheNextLineWithItsComma) {
    Static record;
    record.fullyPlastic = cow_String(std::string(109, 'x'));
    record.stabilizationMethod = Static::StabilizationEnm{1};
    const std::string start = "*Static, fully plastic=" + std::string(109, 'x');
    ASSERT_EQ(start.size(), 132U);
    EXPECT_EQ(Written(oif_Static(record)), start + "\n, stabilize=0.0002\n1., 1., 1e-05, 1.\n");
    record.fullyPlastic = cow_String(std::string(108, 'x'));
    EXPECT_EQ(Written(oif_Static(record)),
              "*Static, fully plastic=" + std::string(108, 'x') + ", stabilize=0.0002\n1., 1., 1e-05, 1.\n");
}

TEST(Static, StepOfAnotherClass_Raises) {
    EXPECT_EQ(Raised([] {
                  oif_Static{kprC_GeostaticStep()};
              }).find("class check failed: found kprC_GeostaticStep, expected kprC_StaticStep"),
              0U);
}

TEST(StaticRiks, Parameters_FollowTheRecord) {
    ExpectTexts<Riks>(
        {
            {"adiabatic", [](Riks& s) { s.adiabatic = true; },
             "*Static, adiabatic, riks\n1., 1., 1e-05, , , \n"},
            {"direct", [](Riks& s) { s.timeIncrementationMethod = Increments::DIRECT; },
             "*Static, direct, riks\n1., 1., , , , \n"},
            {"direct without a stop",
             [](Riks& s) {
                 s.timeIncrementationMethod = Increments::DIRECT;
                 s.noStop = true;
             },
             "*Static, direct=NO STOP, riks\n1., 1., , , , \n"},
            {"fully plastic", [](Riks& s) { s.fullyPlastic = "P"; },
             "*Static, fully plastic=P, riks\n1., 1., 1e-05, , , \n"},
            {"long term", [](Riks& s) { s.longTerm = true; },
             "*Static, long term, riks\n1., 1., 1e-05, , , \n"},
            {"bounded arc", [](Riks& s) { s.maxArcInc = 0.1; }, "*Static, riks\n1., 1., 1e-05, 0.1, , \n"},
            // Only 1e36 goes without saying; the unset value is a value here.
            {"arc bound unset", [](Riks& s) { s.maxArcInc = cls_UnsetDouble; },
             "*Static, riks\n1., 1., 1e-05, 1.79769e+308, , \n"},
            {"load factor", [](Riks& s) { s.maxLPF = 5.0; }, "*Static, riks\n1., 1., 1e-05, , 5., \n"},
            {"monitored node",
             [](Riks& s) {
                 s.nodeMonitored = true;
                 s.dof = 3;
                 s.dofValue = -0.25;
             },
             "*Static, riks\n1., 1., 1e-05, , , I.\"a b\", 3, -0.25\n"},
            {"everything, direct",
             [](Riks& s) {
                 s.adiabatic = true;
                 s.timeIncrementationMethod = Increments::DIRECT;
                 s.noStop = true;
                 s.initialArcInc = 0.5;
                 s.totalArc = 2.0;
                 s.minArcInc = 0.1;
                 s.maxArcInc = 0.2;
                 s.maxLPF = 3.0;
                 s.fullyPlastic = "P";
                 s.nodeMonitored = true;
                 s.longTerm = true;
             },
             "*Static, adiabatic, direct=NO STOP, fully plastic=P, long term, riks\n"
             "0.5, 2., , , 3., I.\"a b\", 1, 0.\n"},
        },
        RiksOn);
}

TEST(StaticRiks, NoMonitoredNode_KeepsTheSeparatorsAroundTheLoadFactorOnPurpose) {
    ExpectTexts<Riks>({{"defaults", [](Riks&) {}, "*Static, riks\n1., 1., 1e-05, , , \n"}}, RiksOn);
}

TEST(StaticRiks, LongName_BreaksOnceBeforeTheNextParameter) {
    Riks record;
    record.fullyPlastic = cow_String(std::string(200, 'x'));
    const std::string start = "*Static, fully plastic=" + std::string(200, 'x') + "\n";
    EXPECT_EQ(Written(RiksOn(record)), start + ", riks\n1., 1., 1e-05, , , \n");
    record.longTerm = true;
    EXPECT_EQ(Written(RiksOn(record)), start + ", long term, riks\n1., 1., 1e-05, , , \n");
}

TEST(StaticLinearPerturbation, Step_WritesTheKeywordAlone) {
    EXPECT_EQ(Written(oif_StaticLinearPerturbation(kprC_StaticLinearPerturbationStep())), "*Static\n");
}

TEST(Geostatic, Step_WritesTheKeywordAlone) {
    EXPECT_EQ(Written(oif_Geostatic(kprC_GeostaticStep())), "*Geostatic\n");
}

TEST(Soils, Parameters_FollowTheRecord) {
    ExpectTexts<oif_Soils, Soils>({
        {"defaults", [](Soils&) {}, "*Soils, consolidation, end=PERIOD, utol=1.0\n1., 1., 1e-05, 1., \n"},
        {"end at a rate", [](Soils& s) { s.end = 0.1; },
         "*Soils, consolidation, end=SS, utol=1.0\n1., 1., 1e-05, 1., 0.1\n"},
        {"end at rate zero", [](Soils& s) { s.end = 0.0; },
         "*Soils, consolidation, end=SS, utol=1.0\n1., 1., 1e-05, 1., 0.\n"},
        {"steady state", [](Soils& s) { s.response = Soils::ResponseEnm::STEADY_STATE; },
         "*Soils, utol=1.0\n1., 1., 1e-05, 1., \n"},
        {"response of no known kind", [](Soils& s) { s.response = Soils::ResponseEnm{2}; },
         "*Soils, utol=1.0\n1., 1., 1e-05, 1., \n"},
        {"steady state with a rate",
         [](Soils& s) {
             s.response = Soils::ResponseEnm::STEADY_STATE;
             s.end = 0.1;
         },
         "*Soils, utol=1.0\n1., 1., 1e-05, 1., 0.1\n"},
        {"creep tolerance", [](Soils& s) { s.cetol = 0.01; },
         "*Soils, consolidation, end=PERIOD, utol=1.0, cetol=0.01\n1., 1., 1e-05, 1., \n"},
        {"no creep",
         [](Soils& s) {
             s.creep = false;
             s.cetol = 0.01;
         },
         "*Soils, consolidation, end=PERIOD, utol=1.0, creep=none\n1., 1., 1e-05, 1., \n"},
        {"fixed increments",
         [](Soils& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.utol = 2.0;
             s.cetol = 0.01;
         },
         "*Soils, consolidation, end=PERIOD\n1., 1., , ,\n"},
        {"fixed increments with a rate, without creep",
         [](Soils& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.end = 0.1;
             s.creep = false;
         },
         "*Soils, consolidation, end=SS, creep=none\n1., 1., , ,0.1\n"},
        {"stabilized by energy", [](Soils& s) { s.stabilizationMethod = Soils::StabilizationMethodEnm{1}; },
         "*Soils, consolidation, end=PERIOD, utol=1.0, stabilize=0.0002\n1., 1., 1e-05, 1., \n"},
        {"stabilized by a factor", [](Soils& s) { s.stabilizationMethod = Soils::StabilizationMethodEnm{2}; },
         "*Soils, consolidation, end=PERIOD, utol=1.0, stabilize, factor=0.0002\n1., 1., 1e-05, 1., \n"},
    });
}

TEST(Soils, PressureToleranceOfZeroOrLess_IsTheTextOfOne) {
    ExpectTexts<oif_Soils, Soils>({
        {"above zero", [](Soils& s) { s.utol = 1.0; },
         "*Soils, consolidation, end=PERIOD, utol=1.\n1., 1., 1e-05, 1., \n"},
        {"below zero", [](Soils& s) { s.utol = -3.0; },
         "*Soils, consolidation, end=PERIOD, utol=1.0\n1., 1., 1e-05, 1., \n"},
    });
}

TEST(Visco, Parameters_FollowTheRecord) {
    const std::vector<ProcedureCase<Visco>> cases = {
        {"defaults", [](Visco&) {}, "*Visco, cetol=0.\n1., 1., 1e-05, 1.\n"},
        {"tolerance", [](Visco& s) { s.cetol = 5e-4; }, "*Visco, cetol=0.0005\n1., 1., 1e-05, 1.\n"},
        {"fixed increments",
         [](Visco& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.cetol = 5e-4;
         },
         "*Visco\n1., 1., \n"},
        {"explicit creep", [](Visco& s) { s.creepIntegration = Visco::CreepIntegrationEnm::EXPLICIT; },
         "*Visco, cetol=0., creep=explicit\n1., 1., 1e-05, 1.\n"},
        {"stabilized by energy", [](Visco& s) { s.stabilizationMethod = Visco::StabilizationMethodEnm{1}; },
         "*Visco, cetol=0., stabilize=0.0002\n1., 1., 1e-05, 1.\n"},
        {"stabilized by a factor", [](Visco& s) { s.stabilizationMethod = Visco::StabilizationMethodEnm{2}; },
         "*Visco, cetol=0., stabilize, factor=0.0002\n1., 1., 1e-05, 1.\n"},
    };
    ExpectTexts(cases, [](const Visco& record) { return oif_Visco(record, true); });
}

TEST(Visco, OtherFormat_WordsCreepDifferently) {
    Visco record;
    record.creepIntegration = Visco::CreepIntegrationEnm::EXPLICIT;
    EXPECT_EQ(Written(oif_Visco(record, false)), "*Visco, cetol=0., explicit\n1., 1., 1e-05, 1.\n");
}

TEST(Anneal, Temperature_IsWrittenWhenSet) {
    kprC_AnnealStep record;
    EXPECT_EQ(Written(oif_Anneal(record)), "*Anneal\n");
    record.refTemp = 0.0;
    EXPECT_EQ(Written(oif_Anneal(record)), "*Anneal, temperature=0.\n");
}

TEST(Buckle, DataLine_FollowsTheSolver) {
    ExpectTexts<oif_Buckle, Buckle>({
        {"subspace", [](Buckle&) {}, "*Buckle\n10, , 18, 30\n"},
        {"subspace with all limits",
         [](Buckle& s) {
             s.numEigen = 4;
             s.maxEigen = 3.5;
             s.vectors = 12;
             s.maxIterations = 40;
             s.minEigen = 1.0;
             s.blockSize = 3;
             s.maxBlocks = 9;
         },
         "*Buckle\n4, 3.5, 12, 40\n"},
        {"Lanczos", [](Buckle& s) { s.eigensolver = Buckle::EigensolverEnm::LANCZOS; },
         "*Buckle, eigensolver=lanczos\n10, , , \n"},
        {"Lanczos, one-sided",
         [](Buckle& s) {
             s.eigensolver = Buckle::EigensolverEnm::LANCZOS;
             s.minEigen = -2.0;
             s.maxBlocks = 35;
         },
         "*Buckle, eigensolver=lanczos\n10, -2., , 35\n"},
    });
}

TEST(Buckle, LanczosBoundAndBlockSize_HaveNoSeparatorOnPurpose) {
    Buckle record;
    record.eigensolver = Buckle::EigensolverEnm::LANCZOS;
    record.minEigen = 0.5;
    record.maxEigen = 100.0;
    record.blockSize = 8;
    record.maxBlocks = 35;
    EXPECT_EQ(Written(oif_Buckle(record)), "*Buckle, eigensolver=lanczos\n10, 0.5, 100.8, 35\n");
}
