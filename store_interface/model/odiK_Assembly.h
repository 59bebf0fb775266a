#ifndef QRX_STORE_ODIK_ASSEMBLY_H
#define QRX_STORE_ODIK_ASSEMBLY_H

#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

/// What hangs behind a part, or behind an instance that differs from its part: attributes on the sets of its
/// mesh. A later section assignment wins on an element.
struct odiK_PartInstance {
    ptoC_PartAttributeList sectionAssignments;
    ptoC_PartAttributeList materialOrientations;
    ptoC_PartAttributeList beamOrientations;

    const ptoC_PartAttributeList& ConstGetSectionAssignment() const { return sectionAssignments; }
};

/// The assembly-level object: its texts and its attribute lists.
struct odiK_Assembly : cls_RecordOf<odiK_Assembly> {
    static constexpr cls_ClassInfo Class{"odiK_Assembly", "The assembly of a model."};

    cow_String name = "Assembly";
    cow_String solverInput;
    ptoC_PartAttributeList sectionAssignments;
    ptoC_PartAttributeList connectorOrientations;

    const ptoC_PartAttributeList& ConstGetSectionAssignment() const { return sectionAssignments; }
    const ptoC_PartAttributeList& ConstGetConnectorOrientation() const { return connectorOrientations; }
    /// "ConnOri-" and the place in the list, from 0.
    static cow_String ConnectorOrientationName(int place);
    /// Appends; an orientation without a name gets that of its place.
    void AppendConnectorOrientation(const ptoC_ConnectorOrientation& orientation);

    static const cls_FieldTable& Fields();
};

#endif
