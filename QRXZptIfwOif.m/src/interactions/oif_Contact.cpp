#include "interactions/oif_Contact.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>

namespace {

const kinC_ContactExp& GeneralContact(const kinC_Interaction& interaction) {
    return nex_canDynamicCastRef<kinC_ContactExp>(interaction, NEX_HERE);
}

/// The pairs whose attribute passes the test. A pair without an attribute has none.
template <class V, class Test>
oif_SurfacePairLines<V> LinesOf(const cow_List<kinC_SurfacePair>& pairs,
                                const cow_List<mdl_PropAttr<V>>& attributes, const qkw_ModelInfo& modelInfo,
                                const Test& test) {
    oif_SurfacePairLines<V> lines;
    const int count = std::min(pairs.Length(), attributes.Length());
    for (int i = 0; i < count; ++i) {
        if (!test(attributes[i])) continue;
        lines.push_back({oif_SurfaceName(pairs[i].first, modelInfo),
                         oif_SurfaceName(pairs[i].second, modelInfo), attributes[i].ConstGet()});
    }
    return lines;
}

/// The pairs with an attribute that was ever set, also one that is cleared in the step.
template <class V>
oif_SurfacePairLines<V> Assigned(const cow_List<kinC_SurfacePair>& pairs,
                                 const cow_List<mdl_PropAttr<V>>& attributes,
                                 const qkw_ModelInfo& modelInfo) {
    return LinesOf(pairs, attributes, modelInfo, [](const mdl_PropAttr<V>& attribute) {
        return attribute.State() != mdl_PropAttributeStateEnm::NEVER_SET;
    });
}

oif_SurfacePairLines<bool> Domains(const cow_List<kinC_SurfacePair>& pairs,
                                   const cow_List<mdl_PropAttr<bool>>& attributes,
                                   const qkw_ModelInfo& modelInfo) {
    return LinesOf(pairs, attributes, modelInfo,
                   [](const mdl_PropAttr<bool>& attribute) { return attribute.ConstGet(); });
}

/// The keyword line, and a data line for each entry; nothing without entries.
template <class V, class WriteLine>
void WriteLines(utl_Stream& stream, const char* keyword, const oif_SurfacePairLines<V>& lines,
                const WriteLine& writeLine) {
    if (lines.empty()) return;
    oif_KeywordLine(stream, keyword).End();
    for (const auto& line : lines) {
        writeLine(line);
        stream << endl;
    }
}

} // namespace

oif_ContactPropertyAssignments::oif_ContactPropertyAssignments(const kinC_Interaction& interaction,
                                                               const cow_String& step,
                                                               const qkw_ModelInfo& modelInfo) {
    const kinC_ContactExp& contact = GeneralContact(interaction);
    lines_ =
        Assigned(contact.propertyAssignmentPairs, contact.ConstGetState(step).propertyAssignments, modelInfo);
}

// The first word alone begins with a capital in these three.
void oif_ContactPropertyAssignments::Write(utl_Stream& stream) const {
    WriteLines(stream, "*Contact property assignment", lines_, [&](const auto& line) {
        stream << line.first << " , " << line.second << " , " << qkw_QuorixName(line.value, false);
    });
}

oif_SurfacePropertyAssignments::oif_SurfacePropertyAssignments(const kinC_Interaction& interaction,
                                                               const cow_String& step,
                                                               const qkw_ModelInfo& modelInfo) {
    const kinC_ContactExp& contact = GeneralContact(interaction);
    lines_ = Assigned(contact.surfacePropertyAssignmentPairs,
                      contact.ConstGetState(step).surfacePropertyAssignments, modelInfo);
}

void oif_SurfacePropertyAssignments::Write(utl_Stream& stream) const {
    WriteLines(stream, "*Surface property assignment, property=THICKNESS", lines_, [&](const auto& line) {
        stream << line.first << " , ";
        switch (line.value.type) {
        case 0: stream << "ORIG"; break;
        case 3: stream << "CURR"; break;
        default: stream << line.value.value; break;
        }
        stream << " , " << line.value.scale;
    });
}

oif_ContactFormulationAssignments::oif_ContactFormulationAssignments(const kinC_Interaction& interaction,
                                                                     const cow_String& step,
                                                                     const qkw_ModelInfo& modelInfo) {
    const kinC_ContactExp& contact = GeneralContact(interaction);
    lines_ = Assigned(contact.formulationAssignmentPairs, contact.ConstGetState(step).formulationAssignments,
                      modelInfo);
}

void oif_ContactFormulationAssignments::Write(utl_Stream& stream) const {
    WriteLines(stream, "*Contact formulation, type=PURE MASTER-SLAVE", lines_, [&](const auto& line) {
        stream << line.first << " , " << line.second << " , "
               << omu_PrimEnum<kinC_MasterSlave::MasterSlaveEnm, 1>(line.value.masterSlave).GetString();
    });
}

oif_Contact::oif_Contact(const cow_String&, const mdl_ObjCow<kinC_Interaction>& interaction,
                         const cow_String& step, const qkw_ModelInfo& modelInfo) {
    const kinC_ContactExp& contact = GeneralContact(interaction.ConstGet());
    const kinC_ContactExpState& state = contact.ConstGetState(step);
    wholeModel_ = contact.WholeModelContact(step);
    inclusions_ = Domains(contact.inclusionPairs, state.inclusions, modelInfo);
    exclusions_ = Domains(contact.exclusionPairs, state.exclusions, modelInfo);
    assignments_.Append(oif_ContactPropertyAssignments(contact, step, modelInfo));
    assignments_.Append(oif_SurfacePropertyAssignments(contact, step, modelInfo));
    assignments_.Append(oif_ContactFormulationAssignments(contact, step, modelInfo));
}

void oif_Contact::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Contact").Op(oif_Op::NEW).End();
    WriteDomains(stream, true);
    WriteDomains(stream, false);
    for (const qkw_KeywordHandle& assignment : assignments_) assignment.ConstGet().Write(stream);
}

void oif_Contact::WriteDomains(utl_Stream& stream, bool inclusions) const {
    const char* keyword = inclusions ? "*Contact Inclusions" : "*Contact Exclusions";
    if (inclusions && wholeModel_) {
        oif_KeywordLine(stream, keyword).Fixed(", ALL EXTERIOR").End();
        return;
    }
    WriteLines(stream, keyword, inclusions ? inclusions_ : exclusions_,
               [&](const auto& line) { stream << line.first << " , " << line.second; });
}
