#include "store_interface/records/cls_FieldTable.h"

const cls_FieldTable& cls_Record::Fields() {
    static const cls_FieldTable none;
    return none;
}

void cls_Record::DBWrite(cls_WriteVisitor& visitor) const {
    for (const cls_Field& field : DynFields().All()) visitor.Visit(field, *field.type, field.In(*this));
}

const cls_Field* cls_FieldTable::Find(std::string_view name) const {
    for (const cls_Field& field : fields_) {
        if (name == field.name) return &field;
    }
    return nullptr;
}

std::string cls_Field::Documentation() const {
    std::string text(doc);
    if (unit != nullptr) text.append(" (").append(unit).append(")");
    return text;
}

bool cls_RecordsEqual(const cls_Record& a, const cls_Record& b) {
    if (&a == &b) return true;
    if (a.DynTypeId() != b.DynTypeId()) return false;
    for (const cls_Field& field : a.DynFields().All()) {
        if (!field.type->Equal(field.In(a), field.In(b))) return false;
    }
    return true;
}

bool cls_IsUnset(const cls_FieldType& type, const void* value) {
    switch (type.Kind()) {
    case cls_FieldKind::Double: return *static_cast<const double*>(value) == cls_UnsetDouble;
    case cls_FieldKind::Int: return *static_cast<const int*>(value) == cls_UnsetInt;
    default: return false;
    }
}
