#include "sections/oif_SolidSections.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

using Material = qkw_QuorixName;

/// Numbers have no point here, and the material's name no quotes.
void WriteLayer(utl_Stream& stream, const kseC_CompositeSolidLayer& layer) {
    stream << cow_String(layer.thickness) << ", " << cow_String(layer.integrationPoints) << ", "
           << layer.materialName << ", " << cow_String(layer.orientationAngle) << endl;
}

void WriteLayers(utl_Stream& stream, const kseC_CompositeSolidSection& solid) {
    const auto& layers = solid.layers;
    for (int i = 0; i < layers.Length(); ++i) WriteLayer(stream, layers[i]);
    // The whole list once more, so the layer in the middle stands twice; but not a single one.
    if (!solid.symmetric || layers.Length() < 2) return;
    for (int i = layers.Length() - 1; i >= 0; --i) WriteLayer(stream, layers[i]);
}

} // namespace

void oif_SolidSection::Write(utl_Stream& stream) const {
    using Form = oif_SectionForm<oif_SolidSection>;
    static constexpr Form forms[] = {
        Form::Of<kseC_TrussSection, &oif_SolidSection::WriteTruss>(),
        Form::Of<kseC_HomogenousSolidSection, &oif_SolidSection::WriteHomogeneous>(),
        Form::Of<kseC_CompositeSolidSection, &oif_SolidSection::WriteComposite>(),
    };
    if (const Form* form = oif_FindRow(forms, Section().DynTypeId())) {
        return form->write(*this, stream, Section());
    }
    if (nex_canDynamicCastPtr<kseC_SolidSection>(&Section()) == nullptr) {
        nex_Raise("Neither solid nor truss section type");
    }
    oif_KeywordLine line = KeywordLine(stream);
    WriteNames(line);
    nex_Raise("Unknown solid section type");
}

oif_KeywordLine oif_SolidSection::KeywordLine(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Solid Section, elset=");
    line.Text(SetName());
    return line;
}

void oif_SolidSection::WriteTruss(utl_Stream& stream, const kseC_TrussSection& truss) const {
    KeywordLine(stream).Breaking("material=", Material(truss.materialName, false)).End();
    stream << truss.area << "," << endl;
}

void oif_SolidSection::WriteHomogeneous(utl_Stream& stream, const kseC_HomogenousSolidSection& solid) const {
    oif_KeywordLine line = KeywordLine(stream);
    WriteNames(line);
    line.Breaking("material=", Material(solid.materialName, false)).End();
    stream << solid.thickness << "," << endl;
}

void oif_SolidSection::WriteComposite(utl_Stream& stream, const kseC_CompositeSolidSection& solid) const {
    oif_KeywordLine line = KeywordLine(stream);
    line.Breaking("composite");
    WriteNames(line);
    line.End();
    WriteLayers(stream, solid);
}

void oif_MembraneSection::Write(utl_Stream& stream) const {
    const auto& membrane = nex_canDynamicCastRef<kseC_MembraneSection>(Section(), NEX_HERE);
    oif_KeywordLine line(stream, "*Membrane Section, elset=");
    line.Text(SetName()).Breaking("material=", Material(membrane.materialName, false));
    WriteNames(line);
    line.BreakingIf(membrane.poissonDefinition != membrane.poissonDefinitionDef(),
                    "poisson=", membrane.poisson)
        .End();
    stream << membrane.thickness << "," << endl;
}

void oif_GasketSection::Write(utl_Stream& stream) const {
    if (Section().DynTypeId() != kseC_GasketSection::TypeId()) return;
    const auto& gasket = nex_canDynamicCastRef<kseC_GasketSection>(Section(), NEX_HERE);
    oif_KeywordLine line(stream, "*Gasket Section, elset=");
    line.Text(SetName());
    stream.OptionalLineBreak();
    line.Text(isBehavior_ ? ", behavior=" : ", material=").Text(Material(gasket.materialName, false));
    WriteNames(line);
    if (gasket.stabilizationStiffness != gasket.stabilizationStiffnessDef()) {
        stream.OptionalLineBreak();
        line.Text(", stabilization stiffness=").Text(gasket.stabilizationStiffness);
    }
    line.End();
    if (gasket.initialThickness != gasket.initialThicknessDef()) stream << gasket.initialThickness;
    stream << ", " << gasket.initialGap << ", " << gasket.initialVoid << ", " << gasket.crossSection << endl;
}
