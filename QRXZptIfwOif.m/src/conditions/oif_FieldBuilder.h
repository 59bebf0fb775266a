#ifndef QRX_OIF_FIELDBUILDER_H
#define QRX_OIF_FIELDBUILDER_H

#include "conditions/oif_ConditionBuilder.h"

/// Initial conditions and predefined fields of the steps. A field variable is written in every step that it
/// lives in.
class oif_FieldBuilder final : public oif_ConditionBuilder<oif_FieldBuilder> {
public:
    explicit oif_FieldBuilder(oif_ModelInfo& modelInfo) : oif_ConditionBuilder(modelInfo, "FIELDS") {}
    void Build() override;

private:
    void BuildFieldsHistory();
    /// The most values that a field of the initial step has at a node; 0 without one.
    int FindMaxGenFieldSizeInModel() const;
    int FindMaxTempSizeInModel() const;
    template <class Field, class SizeOf>
    int FindMaxSize(const SizeOf& sizeOf) const;
};

#endif
