#ifndef QRX_OIF_CONTACTPROPERTY_H
#define QRX_OIF_CONTACTPROPERTY_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"

/// The head of a contact property; in an implicit job with the area of a contact, in an explicit one with
/// the thickness of a pad if there is one:
///     *Surface Interaction, name=Prop-1
///     1.,
///     *Surface Interaction, name=Prop-1, pad thickness=0.1
class oif_SurfaceInteraction final : public qkw_KeywordOf<oif_SurfaceInteraction> {
public:
    oif_SurfaceInteraction(const cow_String& name, const qkw_ModelInfo& modelInfo, double contactArea,
                           double padThickness)
        : name_(name), product_(modelInfo.AnalysisProduct()), contactArea_(contactArea),
          padThickness_(padThickness) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kprC_AnalysisProductEnm product_;
    double contactArea_;
    double padThickness_;
};

/// What the keywords of a contact property hold.
class oif_ContactPropertyKeyword : public qkw_Keyword {
public:
    oif_ContactPropertyKeyword(const mdl_ObjCow<kinC_InteractionProperty>& property,
                               const qkw_ModelInfo& modelInfo)
        : property_(property), product_(modelInfo.AnalysisProduct()) {}

protected:
    bool IsImplicit() const { return product_ == kprC_AnalysisProductEnm::IMPLICIT; }
    bool IsExplicit() const { return product_ == kprC_AnalysisProductEnm::EXPLICIT; }
    /// Null for a property of another class.
    const kinC_ContactProperty* ContactProperty() const;
    /// Null for a property of another class, and where the behaviour is absent.
    template <auto Member>
    auto Behavior() const {
        const kinC_ContactProperty* property = ContactProperty();
        return property == nullptr ? nullptr : (property->*Member).Referent();
    }

private:
    mdl_ObjCow<kinC_InteractionProperty> property_;
    kprC_AnalysisProductEnm product_;
};

/// Friction, of a property or behind "*Change Friction":
///     *Friction, slip tolerance=0.005
///     0.1,
/// A property of another class raises "Unimplemented *Friction print".
class oif_Friction final : public qkw_KeywordOf<oif_Friction, oif_ContactPropertyKeyword> {
public:
    /// `changing`, that it changes a friction, makes no difference to the text.
    oif_Friction(const mdl_ObjCow<kinC_InteractionProperty>& property, const qkw_ModelInfo& modelInfo,
                 [[maybe_unused]] bool changing)
        : qkw_KeywordOf(property, modelInfo) {}
    void Write(utl_Stream& stream) const override;

private:
    void AddParameters(oif_KeywordLine& line, const kinC_TangentialBehavior& friction) const;
    void WriteData(utl_Stream& stream, const kinC_TangentialBehavior& friction) const;
};

/// `*Change Friction, interaction=NAME`; the new friction follows.
class oif_ChangeFriction final : public qkw_KeywordOf<oif_ChangeFriction> {
public:
    explicit oif_ChangeFriction(const cow_String& propertyName) : propertyName_(propertyName) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String propertyName_;
};

/// Pressure against overclosure:
///     *Surface Behavior, no separation, pressure-overclosure=HARD
///     *Surface Behavior, penalty
///     1000., 0., 0.5
class oif_SurfaceBehavior final : public qkw_KeywordOf<oif_SurfaceBehavior, oif_ContactPropertyKeyword> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// Damping of the approach; nothing when all of it is zero:
///     *Contact Damping, definition=DAMPING COEFFICIENT
///     0.1, 0.5, 0.
class oif_ContactDamping final : public qkw_KeywordOf<oif_ContactDamping, oif_ContactPropertyKeyword> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// Heat conduction across the gap, by its width and by the pressure, a keyword each:
///     *Gap Conductance
///     10., 0.
///     *Gap Conductance, pressure
///     20., 0.
class oif_GapConductance final : public qkw_KeywordOf<oif_GapConductance, oif_ContactPropertyKeyword> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// Heat from dissipated work:
///     *Gap Heat Generation
///     1., 0.5
class oif_GapHeatGeneration final : public qkw_KeywordOf<oif_GapHeatGeneration, oif_ContactPropertyKeyword> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// Radiation across the gap; the slave's emissivity comes first:
///     *Gap Radiation
///     0.8, 0.9
///     1., 0.
class oif_GapRadiation final : public qkw_KeywordOf<oif_GapRadiation, oif_ContactPropertyKeyword> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;
    void Write(utl_Stream& stream) const override;
};

#endif
