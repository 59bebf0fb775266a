#include "materials/oif_SpecialOptions.h"

namespace {

/// Test data of a rubber. Without lateral strains in the table, a blank column keeps the place of the later
/// ones.
template <class R>
void WriteTestData(utl_Stream& stream, const char* keyword, const R& option) {
    oif_OptionLine(stream, keyword)
        .BreakingUnless("smooth=", option.smoothing, option.smoothingDef())
        .Dependencies(option.dependencies)
        .End();
    oif_MaterialTable table = oif_PlainTable(option.table);
    if (!option.lateralStrainGiven && (option.temperatureDependency || option.dependencies >= 1)) {
        table.InsertEmptyColumn(2);
    }
    oif_KeepFieldColumns(table, option.table.NumColumns(), option.temperatureDependency, option.dependencies);
    stream << table;
}

const char* PotentialWord(kmaC_Hyperelastic::TypeEnm type) {
    using Type = kmaC_Hyperelastic::TypeEnm;
    switch (type) {
    case Type::ARRUDA_BOYCE: return "arruda-boyce";
    case Type::MARLOW: return "marlow";
    case Type::MOONEY_RIVLIN: return "mooney-rivlin";
    case Type::NEO_HOOKE: return "neo hooke";
    case Type::OGDEN: return "ogden";
    case Type::POLYNOMIAL: return "polynomial";
    case Type::REDUCED_POLYNOMIAL: return "reduced polynomial";
    case Type::USER: return "user";
    case Type::VAN_DER_WAALS: return "van der waals";
    case Type::YEOH: return "yeoh";
    case Type::UNKNOWN: break;
    }
    return "unknown";
}

bool HasOrder(kmaC_Hyperelastic::TypeEnm type) {
    using Type = kmaC_Hyperelastic::TypeEnm;
    return type == Type::OGDEN || type == Type::POLYNOMIAL || type == Type::REDUCED_POLYNOMIAL;
}

void WriteTests(utl_Stream& stream, const kmaC_Hyperelastic& option) {
    using Test = kmaC_Hyperelastic::MarlowDeviatoricDataEnm;
    // A Marlow material has one deviatoric test, and volumetric data only where they are asked for.
    const bool all = option.type != kmaC_Hyperelastic::TypeEnm::MARLOW;
    const Test test = option.marlowDeviatoricData;
    if (all || test == Test::BIAXIAL) oif_WriteOptions(stream, option.biaxialTestData);
    if (all || test == Test::PLANAR) oif_WriteOptions(stream, option.planarTestData);
    if (all || test == Test::UNIAXIAL) oif_WriteOptions(stream, option.uniaxialTestData);
    if (all || option.volumetricResponse == kmaC_Hyperelastic::VolumetricResponseEnm::VOLUMETRIC_DATA) {
        oif_WriteOptions(stream, option.volumetricTestData);
    }
}

void WriteTolerances(oif_OptionLine& line, const kmaC_Viscoelastic& option) {
    line.BreakingUnless("errtol=", option.errtol, option.errtolDef())
        .BreakingUnless("nmax=", option.nmax, option.nmaxDef());
}

} // namespace

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_BiaxialTestData& option) {
    WriteTestData(stream, keyword, option);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_PlanarTestData& option) {
    WriteTestData(stream, keyword, option);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_UniaxialTestData& option) {
    WriteTestData(stream, keyword, option);
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_VolumetricTestData& option) {
    oif_OptionLine(stream, keyword)
        .BreakingUnless("volinf=", option.volinf, option.volinfDef())
        .BreakingUnless("smooth=", option.smoothing, option.smoothingDef())
        .Dependencies(option.dependencies)
        .End();
    stream << oif_DependentTable(option);
}

void oif_WriteElasticity(utl_Stream& stream, const kmaC_Elastic& option, bool hasViscoelastic) {
    using Type = kmaC_Elastic::TypeEnm;
    oif_OptionLine line(stream, "*Elastic");
    line.Dependencies(option.dependencies);
    if (option.type == Type::ENGINEERING_CONSTANTS) {
        line.Breaking("type=ENGINEERING CONSTANTS");
    } else {
        line.BreakingUnless("type=", option.type, option.typeDef());
    }
    if (hasViscoelastic) line.Moduli(option.longTermModuli);
    line.End();
    stream << oif_DependentTable(option);
    oif_WriteOptions(stream, option.failStrain, option.failStress);
    if (option.noCompression) stream << "*No Compression" << endl;
    if (option.noTension) stream << "*No Tension" << endl;
}

void oif_WriteElasticity(utl_Stream& stream, const kmaC_Hyperelastic& option, bool hasViscoelastic) {
    using Type = kmaC_Hyperelastic::TypeEnm;
    oif_OptionLine line(stream, "*Hyperelastic");
    if (HasOrder(option.type)) line.BreakingUnless("n=", option.n, option.nDef());
    // The polynomial is what a solver takes where no potential is named.
    if (option.type != Type::POLYNOMIAL) line.Breaking(PotentialWord(option.type));
    if (option.testData && option.type != Type::MARLOW) line.Breaking("test data input");
    if (option.type == Type::USER) {
        line.Breaking(option.compressible ? "type=COMPRESSIBLE" : "type=INCOMPRESSIBLE");
    }
    if (option.type == Type::VAN_DER_WAALS && option.testData) {
        line.BreakingUnless("beta=", option.beta, option.betaDef());
    }
    if (option.type == Type::USER) {
        line.BreakingUnless("properties=", option.properties, option.propertiesDef());
    }
    if (hasViscoelastic || !option.hysteresis.IsNull()) {
        line.Moduli(option.moduliTimeScale == kmaC_Hyperelastic::ModuliTimeScaleEnm::LONG_TERM);
    }
    if (option.testData && option.type != Type::UNKNOWN &&
        option.volumetricResponse == kmaC_Hyperelastic::VolumetricResponseEnm::POISSON_RATIO) {
        line.Breaking("poisson=", option.poisson);
    }
    line.End();
    if (option.testData) {
        WriteTests(stream, option);
    } else {
        stream << oif_PlainTable(option.table);
    }
    oif_WriteOptions(stream, option.hysteresis);
}

void oif_WriteElasticity(utl_Stream& stream, const kmaC_Hyperfoam& option, bool hasViscoelastic) {
    oif_OptionLine line(stream, "*Hyperfoam");
    line.BreakingUnless("n=", option.n, option.nDef())
        .BreakingUnless("poisson=", option.poisson, option.poissonDef())
        .BreakingIf(option.testData, "testdata");
    if (hasViscoelastic) line.Moduli(option.longTermModuli);
    line.End();
    if (option.testData) {
        oif_WriteOptions(stream, option.biaxialTestData, option.planarTestData, option.simpleShearTestData,
                         option.uniaxialTestData, option.volumetricTestData);
    } else {
        stream << oif_PlainTable(option.table);
    }
}

void oif_WriteSpecial(utl_Stream& stream, const char* keyword, const kmaC_Viscoelastic& option) {
    using Time = kmaC_Viscoelastic::TimeEnm;
    using Frequency = kmaC_Viscoelastic::FrequencyEnm;
    oif_OptionLine line(stream, keyword);
    // The separator is there whatever follows, even nothing.
    line.Text(", ");
    const auto fitted = [&](const char* form) {
        line.Text(form);
        WriteTolerances(line, option);
    };
    if (option.timeDomain) {
        switch (option.time) {
        case Time::PRONY: line.Text("time=").Text(omu_PrimEnum<Time, 1>(option.time).GetString()); break;
        case Time::CREEP_TEST_DATA: fitted("time=CREEP TEST DATA"); break;
        case Time::RELAXATION_TEST_DATA: fitted("time=RELAXATION TEST DATA"); break;
        case Time::FREQUENCY_DATA: fitted("time=FREQUENCY DATA"); break;
        }
    } else {
        switch (option.frequency) {
        case Frequency::FORMULA:
        case Frequency::TABULAR:
        case Frequency::PRONY:
            line.Text("frequency=").Text(omu_PrimEnum<Frequency, 1>(option.frequency).GetString());
            break;
        case Frequency::CREEP_TEST_DATA: fitted("frequency=CREEP TEST DATA"); break;
        case Frequency::RELAXATION_TEST_DATA: fitted("frequency=RELAXATION TEST DATA"); break;
        }
    }
    line.End();
    stream << oif_PlainTable(option.table);
    oif_WriteOptions(stream, option.combinedTestData, option.shearTestData, option.trs,
                     option.volumetricTestData);
}
