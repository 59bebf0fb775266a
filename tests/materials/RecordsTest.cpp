#include "materials/Materials.h"
#include "model_file/mdf_ModelFile.h"

#include <nlohmann/json.hpp>

#include <fstream>
#include <set>

// The records of materials against defaults.json, which lists the fields of every class in order with types
// and defaults, and the rows of every enumeration.

namespace {

using nlohmann::json;

const json& Expected() {
    static const json expected =
        json::parse(std::ifstream(QRX_MATERIAL_TEST_FOLDER "/defaults.json", std::ios::binary));
    return expected;
}

const cls_ClassEntry& Entry(const std::string& name) {
    const cls_ClassEntry* entry = cls_Classes().FindByName(name);
    if (entry == nullptr || entry->create == nullptr) throw std::runtime_error("no record class " + name);
    return *entry;
}

std::unique_ptr<cls_Record> NewRecord(const std::string& name) {
    return std::unique_ptr<cls_Record>(Entry(name).create());
}

/// The value in the form of defaults.json.
json Shown(const cls_Field& field, const void* value) {
    switch (field.type->Kind()) {
    case cls_FieldKind::Bool: return *static_cast<const bool*>(value);
    case cls_FieldKind::Int: {
        const int number = *static_cast<const int*>(value);
        return number == cls_UnsetInt ? json("unset") : json(number);
    }
    case cls_FieldKind::Double: {
        const double number = *static_cast<const double*>(value);
        return number == cls_UnsetDouble ? json("unset") : json(number);
    }
    case cls_FieldKind::Enum: return static_cast<const cls_EnumType&>(*field.type).Get(value);
    case cls_FieldKind::Table: {
        const auto& table = static_cast<const cls_TableType&>(*field.type).Get(value);
        return table.NumRows() == 0 ? json::array() : json("a table of " + std::to_string(table.NumRows()));
    }
    case cls_FieldKind::List: {
        const int length = static_cast<const cls_ListType&>(*field.type).Length(value);
        return length == 0 ? json::array() : json("a list of " + std::to_string(length));
    }
    case cls_FieldKind::Optional:
        return static_cast<const cls_HolderType&>(*field.type).Get(value) == nullptr ? json(nullptr)
                                                                                     : json("a record");
    default: return "a value of another kind";
    }
}

/// The type in the form of defaults.json.
std::string TypeText(const cls_FieldType& type) {
    switch (type.Kind()) {
    case cls_FieldKind::Bool: return "bool";
    case cls_FieldKind::Int: return "int";
    case cls_FieldKind::Double: return "double";
    case cls_FieldKind::Table: return "table";
    case cls_FieldKind::List: return "list:" + TypeText(static_cast<const cls_ListType&>(type).ItemType());
    case cls_FieldKind::Enum:
        return std::string("enum:") + static_cast<const cls_EnumType&>(type).Table().typeName;
    case cls_FieldKind::Optional:
        return "optional:" +
               std::string(cls_Classes().NameOf(static_cast<const cls_HolderType&>(type).ClassId()).View());
    default: return "another type";
    }
}

class MaterialRecords : public testing::TestWithParam<std::string> {
protected:
    std::unique_ptr<cls_Record> Record() const { return NewRecord(GetParam()); }
    const json& Rows() const { return Expected()["records"][GetParam()]; }
};

std::vector<std::string> RecordNames() {
    std::vector<std::string> names;
    for (const auto& [name, fields] : Expected()["records"].items()) names.push_back(name);
    return names;
}

/// Gives every field another value than its default; tables get columns for all that flags ask for.
void Fill(cls_Record& record) {
    for (const cls_Field& field : record.DynFields().All()) {
        void* value = field.In(record);
        switch (field.type->Kind()) {
        case cls_FieldKind::Bool: *static_cast<bool*>(value) = !*static_cast<bool*>(value); break;
        case cls_FieldKind::Int: *static_cast<int*>(value) = 2; break;
        case cls_FieldKind::Double: *static_cast<double*>(value) = 0.625; break;
        case cls_FieldKind::Enum: {
            const auto& type = static_cast<const cls_EnumType&>(*field.type);
            for (const omu_EnumRow& row : type.Table().rows) {
                if (row.value == type.Get(value)) continue;
                type.Set(value, row.value);
                break;
            }
            break;
        }
        case cls_FieldKind::Table: {
            cow_2DArray<double> table(2, 6);
            for (int i = 0; i < 12; ++i) table.Put(i / 6, i % 6, 1.0 / (i + 1));
            static_cast<const cls_TableType&>(*field.type).Set(value, table);
            break;
        }
        case cls_FieldKind::List: {
            const auto& type = static_cast<const cls_ListType&>(*field.type);
            for (int i = 0; i < 3; ++i) *static_cast<double*>(type.Append(value)) = 0.1 * i;
            break;
        }
        case cls_FieldKind::Optional: {
            const auto& type = static_cast<const cls_HolderType&>(*field.type);
            const std::unique_ptr<cls_Record> held(cls_Classes().Find(type.ClassId())->create());
            Fill(*held);
            type.Set(value, held.get());
            break;
        }
        default: FAIL() << "a field of a kind that materials don't have: " << field.name;
        }
    }
}

std::string ErrorsOf(const mdf_Report& report) {
    std::string errors;
    for (const fnd_Finding& finding : report.findings) errors += report.Line(finding) + "\n";
    return errors;
}

template <class V>
double AsNumber(V value) {
    return static_cast<double>(value);
}

struct ExportedDefault {
    const char* name;
    double value;
    double expected;
};

} // namespace

TEST_P(MaterialRecords, Fields_HaveTheirNamesTypesAndDefaultsInOrder) {
    const auto record = Record();
    const auto& fields = record->DynFields().All();
    json rows = json::array();
    for (const cls_Field& field : fields) {
        rows.push_back({field.name, TypeText(*field.type), Shown(field, field.In(*record))});
    }
    EXPECT_EQ(rows, Rows());
}

TEST_P(MaterialRecords, Fields_AreDocumented) {
    const auto record = Record();
    for (const cls_Field& field : record->DynFields().All()) {
        EXPECT_NE(std::string(field.doc), "") << field.name;
        if (field.type->Kind() != cls_FieldKind::Table) continue;
        EXPECT_EQ(std::string(field.doc).find("columns: "), 0u) << field.name;
    }
}

TEST_P(MaterialRecords, Copies_AreEqualUntilAFieldChanges) {
    const auto record = Record();
    const std::unique_ptr<cls_Record> copy(record->Copy());
    EXPECT_EQ(copy->DynTypeId(), record->DynTypeId());
    EXPECT_TRUE(cls_RecordsEqual(*record, *copy));
    Fill(*copy);
    EXPECT_EQ(cls_RecordsEqual(*record, *copy), record->DynFields().All().empty());
}

INSTANTIATE_TEST_SUITE_P(Each, MaterialRecords, testing::ValuesIn(RecordNames()),
                         [](const auto& record) { return record.param; });

TEST(MaterialRecordList, ClassesOfTheStore_AreJustThese) {
    std::set<std::string> classes = {"kmaC_Material"};
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(kmaC_MaterialOption::TypeId())) {
        classes.insert(entry->info.name);
    }
    const auto names = RecordNames();
    EXPECT_EQ(classes, std::set<std::string>(names.begin(), names.end()));
}

TEST(MaterialEnumerations, RowsOfAll_HaveTheirNumbersNamesAndTexts) {
    json found = json::object();
    for (const std::string& name : RecordNames()) {
        const auto record = NewRecord(name);
        for (const cls_Field& field : record->DynFields().All()) {
            if (field.type->Kind() != cls_FieldKind::Enum) continue;
            const omu_EnumTable& table = static_cast<const cls_EnumType&>(*field.type).Table();
            json rows = json::array();
            for (const omu_EnumRow& row : table.rows) rows.push_back({row.value, row.name, row.text});
            found[table.typeName] = rows;
        }
    }
    EXPECT_EQ(found, Expected()["enumerations"]);
}

TEST(MaterialRecordList, OptionsOfAMaterial_AreAllWrittenButRegularization) {
    // What takes viscoelasticity into account has keywords of their own.
    const std::set<std::string> elsewhere = {"kmaC_Regularization", "kmaC_Elastic", "kmaC_Hyperelastic",
                                             "kmaC_Hyperfoam"};
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(kmaC_MaterialOption::TypeId())) {
        if (elsewhere.count(entry->info.name) != 0) continue;
        const std::unique_ptr<cls_Record> record(entry->create());
        Fill(*record);
        const std::string text = Streamed([&](utl_Stream& stream) {
            oif_WriteOption(stream, static_cast<const kmaC_MaterialOption&>(*record));
        });
        EXPECT_EQ(text.find('*'), 0u) << entry->info.name;
        EXPECT_EQ(text.back(), '\n') << entry->info.name;
    }
}

TEST(MaterialModelFile, MaterialsWithAllOptions_StayTheSame) {
    odb_Odb odb;
    kmaC_Material material;
    Fill(material);
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    model.materials.Insert("FULL", material);
    model.materials.Insert("EMPTY", kmaC_Material());
    std::ostringstream file;
    ASSERT_TRUE(mdf_WriteModelFile(odb, file));
    mdf_Report report;
    const auto back = mdf_ReadModelText(file.str(), "back.json", report);
    ASSERT_NE(back, nullptr) << ErrorsOf(report);
    const auto& materials = back->FindModel(odb_Odb::DefaultModelName())->materials;
    EXPECT_EQ(materials.Size(), 2);
    EXPECT_TRUE(cls_RecordsEqual(materials.ConstGet("FULL"), material));
    EXPECT_TRUE(cls_RecordsEqual(materials.ConstGet("EMPTY"), kmaC_Material()));
}

TEST(ExportedDefaults, OfAllRecords_HaveTheirValues) {
    const ExportedDefault defaults[] = {
        {"kmaC_BiaxialTestData::smoothingDef", AsNumber(kmaC_BiaxialTestData::smoothingDef()), cls_UnsetInt},
        {"kmaC_BrittleCracking::typeDef", AsNumber(kmaC_BrittleCracking::typeDef()), 0},
        {"kmaC_BrittleShear::typeDef", AsNumber(kmaC_BrittleShear::typeDef()), 0},
        {"kmaC_CapCreepCohesion::lawDef", AsNumber(kmaC_CapCreepCohesion::lawDef()), 0},
        {"kmaC_CapCreepConsolidation::lawDef", AsNumber(kmaC_CapCreepConsolidation::lawDef()), 0},
        {"kmaC_ClayPlasticity::hardeningDef", AsNumber(kmaC_ClayPlasticity::hardeningDef()), 0},
        {"kmaC_ClayPlasticity::interceptDef", AsNumber(kmaC_ClayPlasticity::interceptDef()), cls_UnsetDouble},
        {"kmaC_CombinedTestData::shrinfDef", AsNumber(kmaC_CombinedTestData::shrinfDef()), cls_UnsetDouble},
        {"kmaC_CombinedTestData::volinfDef", AsNumber(kmaC_CombinedTestData::volinfDef()), cls_UnsetDouble},
        {"kmaC_ConcreteCompressionDamage::tensionRecoveryDef",
         AsNumber(kmaC_ConcreteCompressionDamage::tensionRecoveryDef()), 0.0},
        {"kmaC_ConcreteTensionDamage::compressionRecoveryDef",
         AsNumber(kmaC_ConcreteTensionDamage::compressionRecoveryDef()), 1.0},
        {"kmaC_ConcreteTensionDamage::typeDef", AsNumber(kmaC_ConcreteTensionDamage::typeDef()), 0},
        {"kmaC_ConcreteTensionStiffening::typeDef", AsNumber(kmaC_ConcreteTensionStiffening::typeDef()), 0},
        {"kmaC_Conductivity::typeDef", AsNumber(kmaC_Conductivity::typeDef()), 0},
        {"kmaC_ContactArea::dependenciesDef", AsNumber(kmaC_ContactArea::dependenciesDef()), 0},
        {"kmaC_Creep::lawDef", AsNumber(kmaC_Creep::lawDef()), 0},
        {"kmaC_CyclicHardening::parametersDef", AsNumber(kmaC_CyclicHardening::parametersDef()), false},
        {"kmaC_Damping::alphaDef", AsNumber(kmaC_Damping::alphaDef()), 0.0},
        {"kmaC_Damping::betaDef", AsNumber(kmaC_Damping::betaDef()), 0.0},
        {"kmaC_Damping::compositeDef", AsNumber(kmaC_Damping::compositeDef()), 0.0},
        {"kmaC_Depvar::deleteVarDef", AsNumber(kmaC_Depvar::deleteVarDef()), 0},
        {"kmaC_Dielectric::typeDef", AsNumber(kmaC_Dielectric::typeDef()), 0},
        {"kmaC_Diffusivity::lawDef", AsNumber(kmaC_Diffusivity::lawDef()), 0},
        {"kmaC_Diffusivity::typeDef", AsNumber(kmaC_Diffusivity::typeDef()), 0},
        {"kmaC_DruckerPrager::eccentricityDef", AsNumber(kmaC_DruckerPrager::eccentricityDef()), 0.1},
        {"kmaC_DruckerPrager::shearCriterionDef", AsNumber(kmaC_DruckerPrager::shearCriterionDef()), 0},
        {"kmaC_DruckerPrager::testDataDef", AsNumber(kmaC_DruckerPrager::testDataDef()), false},
        {"kmaC_DruckerPragerCreep::lawDef", AsNumber(kmaC_DruckerPragerCreep::lawDef()), 0},
        {"kmaC_DruckerPragerHardening::typeDef", AsNumber(kmaC_DruckerPragerHardening::typeDef()), 0},
        {"kmaC_Elastic::noCompressionDef", AsNumber(kmaC_Elastic::noCompressionDef()), false},
        {"kmaC_Elastic::noTensionDef", AsNumber(kmaC_Elastic::noTensionDef()), false},
        {"kmaC_Elastic::typeDef", AsNumber(kmaC_Elastic::typeDef()), 0},
        {"kmaC_ElectricalConductivity::typeDef", AsNumber(kmaC_ElectricalConductivity::typeDef()), 0},
        {"kmaC_Expansion::typeDef", AsNumber(kmaC_Expansion::typeDef()), 0},
        {"kmaC_Expansion::zeroDef", AsNumber(kmaC_Expansion::zeroDef()), 0.0},
        {"kmaC_FluidDensity::pressureDef", AsNumber(kmaC_FluidDensity::pressureDef()), 0.0},
        {"kmaC_FluidDensity::temperatureDef", AsNumber(kmaC_FluidDensity::temperatureDef()), 0.0},
        {"kmaC_FluidExpansion::zeroDef", AsNumber(kmaC_FluidExpansion::zeroDef()), 0.0},
        {"kmaC_Foam::hardeningDef", AsNumber(kmaC_Foam::hardeningDef()), 0},
        {"kmaC_Hyperelastic::betaDef", AsNumber(kmaC_Hyperelastic::betaDef()), cls_UnsetDouble},
        {"kmaC_Hyperelastic::nDef", AsNumber(kmaC_Hyperelastic::nDef()), 1},
        {"kmaC_Hyperelastic::propertiesDef", AsNumber(kmaC_Hyperelastic::propertiesDef()), 0},
        {"kmaC_Hyperfoam::nDef", AsNumber(kmaC_Hyperfoam::nDef()), 1},
        {"kmaC_Hyperfoam::poissonDef", AsNumber(kmaC_Hyperfoam::poissonDef()), cls_UnsetDouble},
        {"kmaC_Hyperfoam::testDataDef", AsNumber(kmaC_Hyperfoam::testDataDef()), false},
        {"kmaC_Hypoelastic::userDef", AsNumber(kmaC_Hypoelastic::userDef()), false},
        {"kmaC_MembraneElastic::dependenciesDef", AsNumber(kmaC_MembraneElastic::dependenciesDef()), 0},
        {"kmaC_MohrCoulomb::deviatoricEccentricityDef",
         AsNumber(kmaC_MohrCoulomb::deviatoricEccentricityDef()), cls_UnsetDouble},
        {"kmaC_MohrCoulomb::meridionalEccentricityDef",
         AsNumber(kmaC_MohrCoulomb::meridionalEccentricityDef()), 0.1},
        {"kmaC_Ornl::aDef", AsNumber(kmaC_Ornl::aDef()), 0.3},
        {"kmaC_Ornl::hDef", AsNumber(kmaC_Ornl::hDef()), cls_UnsetDouble},
        {"kmaC_Ornl::resetDef", AsNumber(kmaC_Ornl::resetDef()), false},
        {"kmaC_Permeability::typeDef", AsNumber(kmaC_Permeability::typeDef()), 0},
        {"kmaC_Piezoelectric::typeDef", AsNumber(kmaC_Piezoelectric::typeDef()), 1},
        {"kmaC_PlanarTestData::smoothingDef", AsNumber(kmaC_PlanarTestData::smoothingDef()), cls_UnsetInt},
        {"kmaC_Plastic::dataTypeDef", AsNumber(kmaC_Plastic::dataTypeDef()), 0},
        {"kmaC_Plastic::hardeningDef", AsNumber(kmaC_Plastic::hardeningDef()), 0},
        {"kmaC_PoreFluidExpansion::zeroDef", AsNumber(kmaC_PoreFluidExpansion::zeroDef()), 0.0},
        {"kmaC_PorousElastic::shearDef", AsNumber(kmaC_PorousElastic::shearDef()), 1},
        {"kmaC_PorousMetalPlasticity::relativeDensityDef",
         AsNumber(kmaC_PorousMetalPlasticity::relativeDensityDef()), cls_UnsetDouble},
        {"kmaC_Regularization::rtolDef", AsNumber(kmaC_Regularization::rtolDef()), 0.03},
        {"kmaC_Regularization::strainRateRegularizationDef",
         AsNumber(kmaC_Regularization::strainRateRegularizationDef()), 0},
        {"kmaC_ShearTestData::shrinfDef", AsNumber(kmaC_ShearTestData::shrinfDef()), cls_UnsetDouble},
        {"kmaC_Sorption::lawAbsorptionDef", AsNumber(kmaC_Sorption::lawAbsorptionDef()), 1},
        {"kmaC_Sorption::lawExsorptionDef", AsNumber(kmaC_Sorption::lawExsorptionDef()), 1},
        {"kmaC_Sorption::scanningDef", AsNumber(kmaC_Sorption::scanningDef()), 0.0},
        {"kmaC_Swelling::lawDef", AsNumber(kmaC_Swelling::lawDef()), 0},
        {"kmaC_TensionStiffening::typeDef", AsNumber(kmaC_TensionStiffening::typeDef()), 1},
        {"kmaC_ThicknessBehavior::dependenciesDef", AsNumber(kmaC_ThicknessBehavior::dependenciesDef()), 0},
        {"kmaC_ThicknessBehavior::tensileStiffnessFactorDef",
         AsNumber(kmaC_ThicknessBehavior::tensileStiffnessFactorDef()), 0.001},
        {"kmaC_ThicknessBehavior::typeDef", AsNumber(kmaC_ThicknessBehavior::typeDef()), 0},
        {"kmaC_ThicknessBehavior::variableUnitsDef", AsNumber(kmaC_ThicknessBehavior::variableUnitsDef()), 0},
        {"kmaC_ThicknessBehavior::yieldOnsetDef", AsNumber(kmaC_ThicknessBehavior::yieldOnsetDef()), 0.1},
        {"kmaC_ThicknessBehavior::yieldOnsetMethodDef",
         AsNumber(kmaC_ThicknessBehavior::yieldOnsetMethodDef()), 0},
        {"kmaC_TransShearElastic::dependenciesDef", AsNumber(kmaC_TransShearElastic::dependenciesDef()), 0},
        {"kmaC_TriaxialTestData::aDef", AsNumber(kmaC_TriaxialTestData::aDef()), cls_UnsetDouble},
        {"kmaC_TriaxialTestData::bDef", AsNumber(kmaC_TriaxialTestData::bDef()), cls_UnsetDouble},
        {"kmaC_TriaxialTestData::ptDef", AsNumber(kmaC_TriaxialTestData::ptDef()), cls_UnsetDouble},
        {"kmaC_Trs::definitionDef", AsNumber(kmaC_Trs::definitionDef()), 0},
        {"kmaC_UniaxialTestData::smoothingDef", AsNumber(kmaC_UniaxialTestData::smoothingDef()),
         cls_UnsetInt},
        {"kmaC_UserMaterial::unsymmDef", AsNumber(kmaC_UserMaterial::unsymmDef()), false},
        {"kmaC_Viscoelastic::errtolDef", AsNumber(kmaC_Viscoelastic::errtolDef()), 0.01},
        {"kmaC_Viscoelastic::nmaxDef", AsNumber(kmaC_Viscoelastic::nmaxDef()), 13},
        {"kmaC_Viscous::lawDef", AsNumber(kmaC_Viscous::lawDef()), 0},
        {"kmaC_VolumetricTestData::smoothingDef", AsNumber(kmaC_VolumetricTestData::smoothingDef()),
         cls_UnsetInt},
        {"kmaC_VolumetricTestData::volinfDef", AsNumber(kmaC_VolumetricTestData::volinfDef()),
         cls_UnsetDouble},
    };
    for (const ExportedDefault& d : defaults) EXPECT_EQ(d.value, d.expected) << d.name;
}
