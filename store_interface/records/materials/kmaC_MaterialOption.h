#ifndef QRX_STORE_KMAC_MATERIALOPTION_H
#define QRX_STORE_KMAC_MATERIALOPTION_H

#include "store_interface/records/materials/kmaC_MaterialTable.h"

/// One property or behaviour of a material.
class kmaC_MaterialOption : public cls_AbstractRecordOf<kmaC_MaterialOption> {
public:
    static constexpr cls_ClassInfo Class{"kmaC_MaterialOption", "one property or behaviour of a material"};
};

/// On how many directions the columns of a table depend, for all options that say so.
inline constexpr omu_EnumRow kmaC_DirectionRows[] = {
    {0, "ISOTROPIC", "ISOTROPIC"}, {1, "ORTHOTROPIC", "ORTHOTROPIC"}, {2, "ANISOTROPIC", "ANISOTROPIC"}};

/// Base of the option class T whose table may depend on the temperature and on field variables.
template <class T>
class kmaC_DependentOption : public cls_RecordOf<T, kmaC_MaterialOption> {
public:
    bool temperatureDependency = false;
    int dependencies = 0;
    /// Data columns, then the temperature, then the field variables.
    kmaC_MaterialTable table;
};

/// Describes the first two fields of a kmaC_DependentOption.
inline auto kmaC_Dependence() {
    return []<class R>(cls_Describe<R>& fields) {
        fields
            .template Field<&R::temperatureDependency>(
                "temperatureDependency",
                "true: behind its data columns the table has one of temperatures. False with dependencies: "
                "the deck has a blank column in its place")
            .template Field<&R::dependencies>(
                "dependencies", "number of field variables, 0 or more: the last columns of the table");
    };
}

/// Describes all three, `columns` being those of the data.
inline auto kmaC_DependentTable(const char* columns) {
    return [columns]<class R>(cls_Describe<R>& fields) {
        fields.With(kmaC_Dependence()).template Field<&R::table>("table", columns);
    };
}

#endif
