#ifndef QRX_OIF_FIELDBUILDER_H
#define QRX_OIF_FIELDBUILDER_H

#include "base/oif_BlockHeader.h"
#include "base/oif_Component.h"
#include "conditions/oif_OpStatus.h"

/// Initial conditions and predefined fields of the steps. A field variable is written in every step that it
/// lives in.
class oif_FieldBuilder final : public oif_ComponentOf<oif_FieldBuilder> {
public:
    explicit oif_FieldBuilder(oif_ModelInfo& modelInfo)
        : oif_ComponentOf(modelInfo), blockHeader_(cow_String("FIELDS")) {}
    void Build() override;

private:
    void BuildFieldsHistory();
    void ConfigureOpStatus();
    void CreateFieldCard(const cow_String& name, const kpfC_Field& field, const cow_String& stepName,
                         int maxTemperatureSize, int maxGeneralFieldSize);
    void FieldCardDetails(const cow_String& name, const kpfC_Field& field, const cow_String& stepName,
                          int maxTemperatureSize, int maxGeneralFieldSize, const cow_String& loadCaseName,
                          const float& scale);
    /// The most values that a field of the initial step has at a node; 0 without one.
    int FindMaxGenFieldSizeInModel() const;
    int FindMaxTempSizeInModel() const;
    template <class Field, class SizeOf>
    int FindMaxSize(const SizeOf& sizeOf) const;
    bool IsInitialStep(const cow_String& stepName) const;

    oif_FieldOpStatus opStatus_;
    oif_BlockHeader blockHeader_;
};

#endif
