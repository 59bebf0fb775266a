#ifndef QRX_OIF_CONNECTORSECTION_H
#define QRX_OIF_CONNECTORSECTION_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"

/// The section of the connectors of a set:
///     *Connector Section, elset=SET, behavior=NAME
///     Join, Revolute                      one word with a comma behind it, or two
///     "orientation of end 1", orientation of end 2
///     connection data of a slipring; the factor of material flow
/// The third line is there with orientations; blank without them when a fourth follows.
class oif_NewConnectorSection final : public qkw_KeywordOf<oif_NewConnectorSection> {
public:
    /// `setName` goes out as it stands. A default orientation gives none.
    oif_NewConnectorSection(const cow_String& behaviorName, const cow_String& setName,
                            const kseC_ConnectorSection& section,
                            const ptoC_ConnectorOrientation& orientation, const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    cow_String behaviorName_;
    cow_String setName_;
    kseC_ConnectorSection section_;
    cow_String orientations_; // the line; empty: none
};

/// The opening of a behaviour:
///     *Connector Behavior, name=NAME, integration=EXPLICIT, regularize=OFF, extrapolation=LINEAR
class oif_ConnectorBehavior final : public qkw_KeywordOf<oif_ConnectorBehavior> {
public:
    oif_ConnectorBehavior(const cow_String& name, bool regularize, bool useBehaviorRegularization,
                          double regularization, bool extrapolationLinear, bool integrationExplicit)
        : name_(name), regularize_(regularize), useBehaviorRegularization_(useBehaviorRegularization),
          regularization_(regularization), extrapolationLinear_(extrapolationLinear),
          integrationExplicit_(integrationExplicit) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    bool regularize_;
    bool useBehaviorRegularization_;
    double regularization_;
    bool extrapolationLinear_;
    bool integrationExplicit_;
};

/// Reference lengths and angles:
///     *Connector Constitutive Reference
///     six values, a blank for each that is unset
/// Nothing is written when all are.
class oif_ConnectorConstitutiveReference final : public qkw_KeywordOf<oif_ConnectorConstitutiveReference> {
public:
    explicit oif_ConnectorConstitutiveReference(const kseC_ConnectorSection& section)
        : values_(section.constitutiveReference) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_List<double> values_;
};

#endif
