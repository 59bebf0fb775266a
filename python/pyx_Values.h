#ifndef QRX_PYTHON_PYX_VALUES_H
#define QRX_PYTHON_PYX_VALUES_H

#include "python/pyx_Errors.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"

class odiK_Model;

/// The store's values as Python's. A model tells the names of datums.
class pyx_Values {
public:
    explicit pyx_Values(const odiK_Model* model = nullptr) : model_(model) {}

    py::object Of(const cls_FieldType& type, const void* value) const;
    /// {field: value} of what differs from the default.
    py::dict FieldsOf(const cls_Record& record, const cls_Record& byDefault) const;
    /// A record of Python, with the states of what lives across steps.
    py::object Record(const cls_Record& record) const;

    /// A member of an enumeration, or the number where no word is known.
    static py::object Member(const omu_EnumTable& table, int number);

private:
    py::object Number(const cls_FieldType& type, const void* value) const;
    py::object Triple(const cls_TripleType& type, const void* value) const;
    py::object Attribute(const cls_AttributeType& type, const void* value, mdl_GivenEnm mark) const;
    py::object Region(const rgnC_Region& region) const;
    py::object State(const kprC_PropagatingObject& object, const mdl_GivenState& given) const;

    const odiK_Model* model_;
};

#endif
