#include "materials/oif_SpecialOptions.h"

void oif_KeepFieldColumns(oif_MaterialTable& table, int columns, bool temperatureDependency,
                          int dependencies) {
    if (!temperatureDependency && dependencies > 0) table.InsertEmptyColumn(columns - dependencies);
}

oif_MaterialTable oif_DependentTable(const kmaC_MaterialTable& values, bool temperatureDependency,
                                     int dependencies) {
    oif_MaterialTable table(values, dependencies, temperatureDependency);
    oif_KeepFieldColumns(table, values.NumColumns(), temperatureDependency, dependencies);
    return table;
}

oif_MaterialTable oif_PlainTable(const kmaC_MaterialTable& values) {
    return oif_MaterialTable(values, 0, false);
}
