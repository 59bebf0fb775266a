#include "connectors/oif_ConnectorSection.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"

#include <string>

namespace {

using Assembled = kseC_ConnectorSection::AssembledTypeEnm;
using Translational = kseC_ConnectorSection::TranslationalTypeEnm;
using Rotational = kseC_ConnectorSection::RotationalTypeEnm;

/// Replaces the first occurrence; false when there is none.
bool ReplaceFirst(std::string& text, std::string_view what, std::string_view with) {
    const std::size_t place = text.find(what);
    if (place == std::string::npos) return false;
    text.replace(place, what.size(), with);
    return true;
}

/// The line of connection types, from the texts of the types.
std::string ConnectionTypes(const kseC_ConnectorSection& section) {
    std::string text(section.GetConnectionTypeAsString().View());
    switch (section.assembledType) {
    case Assembled::CVJOINT:
    case Assembled::UJOINT: ReplaceFirst(text, " J", ""); break;
    case Assembled::SLIPRING: ReplaceFirst(text, " R", ""); break;
    default: break;
    }
    if (section.translationalType == Translational::PROJECTION_CARTESIAN) {
        ReplaceFirst(text, "Proj", "Projection");
    }
    if (section.rotationalType == Rotational::PROJECTION_FLEXION_TORSION) {
        for (int i = 0; i < 2; ++i) ReplaceFirst(text, "Proj Flex-Tors", "Projection Flexion-Torsion");
    }
    if (!ReplaceFirst(text, " + ", ", ")) text += ",";
    return text;
}

cow_String Orientations(const ptoC_ConnectorOrientation& ends, const qkw_ModelInfo& modelInfo) {
    const bool hasFirst = !ends.ConstGetCsys1().IsNullRef();
    const bool hasSecond = !ends.ConstGetCsys2().IsNullRef();
    const auto second = [&] {
        return cow_String(", ") +
               modelInfo.GetOrientationName(ends.ConstGetCsys2(), ends.ConstGetAngle2(), ends.Name() + "-2");
    };
    if (!hasFirst) return hasSecond ? second() : cow_String();
    const cow_String first =
        modelInfo.GetOrientationName(ends.ConstGetCsys1(), ends.ConstGetAngle1(), ends.Name() + "-1");
    return first + (hasSecond && !ends.orient2sameAs1 ? second() : cow_String(","));
}

} // namespace

oif_NewConnectorSection::oif_NewConnectorSection(const cow_String& behaviorName, const cow_String& setName,
                                                 const kseC_ConnectorSection& section,
                                                 const ptoC_ConnectorOrientation& orientation,
                                                 const qkw_ModelInfo& modelInfo)
    : behaviorName_(behaviorName), setName_(setName), section_(section),
      orientations_(Orientations(orientation, modelInfo)) {}

void oif_NewConnectorSection::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Connector Section")
        .Fixed(", elset=", setName_)
        .FixedIf(!kseC_Utils::IsConnectorSectionEmpty(section_),
                 ", behavior=", qkw_QuorixName(behaviorName_, false))
        .End();
    stream << cow_String(ConnectionTypes(section_));
    stream.LineBreak();
    const bool hasOrientations = !orientations_.IsEmpty();
    if (hasOrientations) {
        stream << orientations_;
        stream.LineBreak();
    }
    if (section_.assembledType == Assembled::SLIPRING) {
        if (!hasOrientations) stream.LineBreak();
        stream << section_.massPerLength << ", ";
        if (section_.contactAngle != kseC_ConnectorSection::contactAngleDef()) {
            stream << section_.contactAngle;
        }
        stream.LineBreak();
        return;
    }
    // It is the projection cartesian type that has the factor, not the flow converter.
    const bool hasFactor = section_.assembledType == Assembled::RETRACTOR ||
                           section_.translationalType == Translational::PROJECTION_CARTESIAN;
    if (!hasFactor || section_.materialFlowFactor == kseC_ConnectorSection::materialFlowFactorDef()) return;
    if (!hasOrientations) stream.LineBreak();
    stream << section_.materialFlowFactor;
    stream.LineBreak();
}

void oif_ConnectorBehavior::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Connector Behavior");
    line.Fixed(", name=", qkw_QuorixName(name_, false))
        .FixedIf(integrationExplicit_, ", integration=EXPLICIT");
    if (!regularize_) {
        line.Breaking("regularize=OFF");
    } else if (!useBehaviorRegularization_) {
        line.BreakingUnless("rtol=", regularization_, kseC_ConnectorSection::regularizationDef());
    }
    line.BreakingIf(extrapolationLinear_, "extrapolation=LINEAR").End();
}

void oif_ConnectorConstitutiveReference::Write(utl_Stream& stream) const {
    bool isEmpty = true;
    for (int i = 0; i < values_.Length(); ++i) isEmpty = isEmpty && values_[i] == -cls_UnsetDouble;
    if (isEmpty) return;
    oif_KeywordLine(stream, "*Connector Constitutive Reference").End();
    for (int i = 0; i < values_.Length(); ++i) {
        if (i > 0) stream << ", ";
        if (values_[i] != -cls_UnsetDouble) stream << values_[i];
    }
    stream.LineBreak();
}
