#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/records/materials/kmaC_Material.h"

#include <array>

namespace {

/// The columns of data that a law of a type has, and which of them have to be above zero.
struct Law {
    unsigned (*option)();
    const char* type; // the word; null for options without types
    int columns;
    const char* names;
    std::array<int, 6> positive; // from 0, up to the first negative one
};

constexpr int kEnd = -1;
constexpr Law kLaws[] = {
    {kmaC_Elastic::TypeId, "ISOTROPIC", 2, "Young's modulus, Poisson's ratio", {0, kEnd}},
    {kmaC_Elastic::TypeId,
     "ORTHOTROPIC",
     9,
     "D1111, D1122, D2222, D1133, D2233, D3333, D1212, D1313, D2323",
     {0, 2, 5, 6, 7, 8}},
    {kmaC_Elastic::TypeId,
     "ANISOTROPIC",
     21,
     "D1111 to D2323, the matrix up to its diagonal",
     {0, 2, 5, kEnd}},
    {kmaC_Elastic::TypeId,
     "ENGINEERING_CONSTANTS",
     9,
     "E1, E2, E3, nu12, nu13, nu23, G12, G13, G23",
     {0, 1, 2, 6, 7, 8}},
    {kmaC_Elastic::TypeId, "LAMINA", 6, "E1, E2, nu12, G12, G13, G23", {0, 1, 3, 4, 5, kEnd}},
    {kmaC_Elastic::TypeId, "TRACTION", 3, "Knn, Kss, Ktt", {0, 1, 2, kEnd}},
    {kmaC_Elastic::TypeId, "COUPLED_TRACTION", 6, "Knn, Kss, Ktt, Kns, Knt, Kst", {0, 1, 2, kEnd}},
    {kmaC_Elastic::TypeId, "SHEAR", 1, "the shear modulus", {0, kEnd}},
    {kmaC_Density::TypeId, nullptr, 1, "the density", {0, kEnd}},
    {kmaC_SpecificHeat::TypeId, nullptr, 1, "the specific heat", {0, kEnd}},
    {kmaC_Conductivity::TypeId, "ISOTROPIC", 1, "the conductivity", {0, kEnd}},
    {kmaC_Conductivity::TypeId, "ORTHOTROPIC", 3, "k11, k22, k33", {0, 1, 2, kEnd}},
    {kmaC_Conductivity::TypeId, "ANISOTROPIC", 6, "k11, k12, k22, k13, k23, k33", {0, 2, 5, kEnd}},
    {kmaC_ElectricalConductivity::TypeId, "ISOTROPIC", 1, "the conductivity", {0, kEnd}},
    {kmaC_ElectricalConductivity::TypeId, "ORTHOTROPIC", 3, "s11, s22, s33", {0, 1, 2, kEnd}},
    {kmaC_ElectricalConductivity::TypeId, "ANISOTROPIC", 6, "s11, s12, s22, s13, s23, s33", {0, 2, 5, kEnd}},
    {kmaC_Expansion::TypeId, "ISOTROPIC", 1, "the coefficient of expansion", {kEnd}},
    {kmaC_Expansion::TypeId, "ORTHOTROPIC", 3, "a11, a22, a33", {kEnd}},
    {kmaC_Expansion::TypeId, "ANISOTROPIC", 6, "a11, a22, a33, a12, a13, a23", {kEnd}},
    {kmaC_Dielectric::TypeId, "ISOTROPIC", 1, "the dielectric constant", {kEnd}},
    {kmaC_Dielectric::TypeId, "ORTHOTROPIC", 3, "D11, D22, D33", {kEnd}},
    {kmaC_Dielectric::TypeId, "ANISOTROPIC", 6, "D11, D12, D22, D13, D23, D33", {kEnd}},
};

/// The word of an option's field "type"; empty without one.
std::string_view TypeOf(const kmaC_MaterialOption& option) {
    const cls_Field* field = option.DynFields().Find("type");
    if (field == nullptr || field->type->Kind() != cls_FieldKind::Enum) return {};
    const auto& type = static_cast<const cls_EnumType&>(*field->type);
    const omu_EnumRow* row = type.Table().Row(type.Get(field->In(option)));
    return row == nullptr ? std::string_view() : std::string_view(row->name);
}

const Law* LawOf(const kmaC_MaterialOption& option) {
    const std::string_view type = TypeOf(option);
    for (const Law& law : kLaws) {
        if (law.option() == option.DynTypeId() && (law.type == nullptr || type == law.type)) return &law;
    }
    return nullptr;
}

/// The table's columns of data, without temperature and field variables.
template <class Option>
long long DataColumns(const Option& option) {
    if (option.dependencies < 0) return 0; // told already
    return static_cast<long long>(option.table.NumColumns()) - (option.temperatureDependency ? 1 : 0) -
           option.dependencies;
}

std::string Cell(int row, int column, double value) {
    return "found " + fnd_Shown(value) + " in row " + std::to_string(row + 1) + ", column " +
           std::to_string(column + 1);
}

/// The first row whose number in the column isn't above zero.
void CheckPositive(const kmaC_MaterialTable& table, int column, fnd_RecordCheck& check) {
    for (int row = 0; row < table.NumRows(); ++row) {
        const double value = table.ConstGet(row, column);
        if (value > 0.0) continue;
        check.Add("not-positive", "table", Cell(row, column, value), "more than 0");
        return;
    }
}

template <class Option>
void CheckLaw(const Option& option, fnd_RecordCheck& check) {
    const Law* law = LawOf(option);
    const long long columns = DataColumns(option);
    if (law == nullptr || option.table.NumRows() == 0 || columns < 1) return;
    if (columns != law->columns) {
        check.Add("table-width", "table", "found rows of " + std::to_string(columns) + " of data",
                  std::to_string(law->columns) + ": " + law->names);
    }
    for (const int column : law->positive) {
        if (column < 0) break;
        if (column < columns) CheckPositive(option.table, column, check);
    }
}

void CheckElastic(const kmaC_Elastic& option, fnd_RecordCheck& check) {
    CheckLaw(option, check);
    if (option.type != kmaC_Elastic::TypeEnm::ISOTROPIC || DataColumns(option) < 2) return;
    for (int row = 0; row < option.table.NumRows(); ++row) {
        const double ratio = option.table.ConstGet(row, 1);
        if (ratio > -1.0 && ratio <= 0.5) continue;
        check.Add("poisson-ratio", "table", Cell(row, 1, ratio), "Poisson's ratio above -1 and up to 0.5");
        return;
    }
}

bool IsEmpty(const kmaC_Material& material) {
    for (const cls_Field& field : material.DynFields().All()) {
        if (field.type->Kind() != cls_FieldKind::Optional) continue;
        if (static_cast<const cls_HolderType&>(*field.type).Get(field.In(material)) != nullptr) return false;
    }
    return true;
}

/// Metres, kilograms and pascals give such numbers; so do slips between these and millimetres.
void NoteUnits(const kmaC_Material& material, fnd_RecordCheck& check) {
    constexpr double kLightest = 1.0;
    constexpr double kStiff = 1e9;
    if (material.density.IsNull() || material.elastic.IsNull()) return;
    const kmaC_MaterialTable& density = material.density.ConstGet().table;
    const kmaC_MaterialTable& elastic = material.elastic.ConstGet().table;
    if (density.NumRows() == 0 || elastic.NumRows() == 0) return;
    const double mass = density.ConstGet(0, 0);
    const double modulus = elastic.ConstGet(0, 0);
    if (mass <= kLightest || modulus <= kStiff) return;
    check.Add(
        "mixed-units", "density",
        "found a density of " + fnd_Shown(mass) + " beside a modulus of " + fnd_Shown(modulus), {},
        "these are numbers in kg, m and Pa: coordinates, thicknesses and loads have to be in m and N too");
}

void CheckMaterial(const kmaC_Material& material, fnd_RecordCheck& check) {
    if (IsEmpty(material)) check.Add("empty-material", "", "found no option", "one at least");
    NoteUnits(material, check);
}

} // namespace

void fnd_AddMaterialValueRules(fnd_RecordRules& rules) {
    rules.Add<CheckElastic>();
    rules.Add<CheckLaw<kmaC_Density>>();
    rules.Add<CheckLaw<kmaC_SpecificHeat>>();
    rules.Add<CheckLaw<kmaC_Conductivity>>();
    rules.Add<CheckLaw<kmaC_ElectricalConductivity>>();
    rules.Add<CheckLaw<kmaC_Expansion>>();
    rules.Add<CheckLaw<kmaC_Dielectric>>();
    rules.Add<CheckMaterial>();
}
