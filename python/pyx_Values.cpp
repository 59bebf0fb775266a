#include "python/pyx_Values.h"

#include "python/pyx_Hooks.h"

#include "model_file/mdf_RecordWriter.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <charconv>

namespace {

py::object Text(const cow_String& text) {
    const std::string_view view = text.View();
    return py::reinterpret_steal<py::object>(
        PyUnicode_DecodeUTF8(view.data(), static_cast<Py_ssize_t>(view.size()), "replace"));
}

/// The number of double precision with the shortest text that reads as the single one.
double Widened(float number) {
    char text[32];
    const auto end = std::to_chars(text, text + sizeof text, number);
    double wide = static_cast<double>(number);
    std::from_chars(text, end.ptr, wide);
    return wide;
}

py::object Table(const cow_2DArray<double>& cells) {
    py::list rows;
    for (int i = 0; i < cells.NumRows(); ++i) {
        py::list row;
        for (int j = 0; j < cells.NumColumns(); ++j) row.append(cells.ConstGet(i, j));
        rows.append(row);
    }
    return rows;
}

py::object Complex(const omi_complex& number) {
    if (number.form == omi_complex::FormEnm::POLAR) return pyx_Hooks::Get().polar(number.real, number.imag);
    return py::reinterpret_steal<py::object>(PyComplex_FromDoubles(number.real, number.imag));
}

} // namespace

py::object pyx_Values::Member(const omu_EnumTable& table, int number) {
    const omu_EnumRow* row = table.Row(number);
    if (row == nullptr) return py::int_(number);
    return pyx_Hooks::Get().member(table.typeName, row->name);
}

py::object pyx_Values::Number(const cls_FieldType& type, const void* value) const {
    switch (type.Kind()) {
    case cls_FieldKind::Int: return py::int_(*static_cast<const int*>(value));
    case cls_FieldKind::Float: return py::float_(Widened(*static_cast<const float*>(value)));
    default: return py::float_(*static_cast<const double*>(value));
    }
}

py::object pyx_Values::Triple(const cls_TripleType& type, const void* value) const {
    double xyz[3];
    type.Get(value, xyz);
    if (type.IsSingle()) {
        for (double& number : xyz) number = Widened(static_cast<float>(number));
    }
    return py::make_tuple(xyz[0], xyz[1], xyz[2]);
}

py::object pyx_Values::Attribute(const cls_AttributeType& type, const void* value, mdl_GivenEnm mark) const {
    if (mark == mdl_GivenEnm::CLEARED) return py::none();
    if (mark == mdl_GivenEnm::VALUE) return Of(type.ValueType(), type.Value(value));
    py::dict given;
    if (mark == mdl_GivenEnm::AS_IT_STANDS) given["value"] = Of(type.ValueType(), type.Value(value));
    given["state"] = Member(omu_EnumTableOf(mdl_PropAttributeStateEnm()), type.State(value));
    return given;
}

py::object pyx_Values::Region(const rgnC_Region& region) const {
    if (!region.HasValue()) return py::none();
    const cow_String& instance = region.InstanceName();
    const cow_String& set = region.SetName();
    const bool hasDots =
        instance.View().find('.') != std::string_view::npos || set.View().find('.') != std::string_view::npos;
    if (hasDots) return pyx_Hooks::Get().region(instance.IsEmpty() ? py::none() : Text(instance), Text(set));
    return instance.IsEmpty() ? Text(set) : Text(instance + "." + set);
}

py::object pyx_Values::Of(const cls_FieldType& type, const void* value) const {
    switch (type.Kind()) {
    case cls_FieldKind::Bool: return py::bool_(*static_cast<const bool*>(value));
    case cls_FieldKind::Int:
    case cls_FieldKind::Double:
    case cls_FieldKind::Float: return Number(type, value);
    case cls_FieldKind::String: return Text(*static_cast<const cow_String*>(value));
    case cls_FieldKind::Enum: {
        const auto& enumeration = static_cast<const cls_EnumType&>(type);
        return Member(enumeration.Table(), enumeration.Get(value));
    }
    case cls_FieldKind::Triple: return Triple(static_cast<const cls_TripleType&>(type), value);
    case cls_FieldKind::Segment: {
        const auto& segment = *static_cast<const gsl_ModelSegment*>(value);
        const cls_FieldType& point = cls_TypeOf<gsl_Point>::Instance();
        return py::make_tuple(Of(point, &segment.Start()), Of(point, &segment.End()));
    }
    case cls_FieldKind::Complex: return Complex(*static_cast<const omi_complex*>(value));
    case cls_FieldKind::Table: return Table(static_cast<const cls_TableType&>(type).Get(value));
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        py::list items;
        for (int i = 0; i < list.Length(value); ++i) items.append(Of(list.ItemType(), list.Item(value, i)));
        return items;
    }
    case cls_FieldKind::Map: {
        const auto& map = static_cast<const cls_MapType&>(type);
        py::dict items;
        for (const cow_String& key : map.Keys(value))
            items[Text(key)] = Of(map.ItemType(), map.Item(value, key));
        return items;
    }
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: {
        const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
        return record == nullptr ? py::none() : Record(*record);
    }
    case cls_FieldKind::Region: return Region(*static_cast<const rgnC_Region*>(value));
    case cls_FieldKind::Datum: {
        const auto& datum = *static_cast<const dtmC_DatumRef*>(value);
        if (datum.IsNullRef() || model_ == nullptr) return py::none();
        return Text(model_->Datums().at(static_cast<std::size_t>(datum.Id()) - 1).name);
    }
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        const bool plain = attribute.State(value) == static_cast<int>(mdl_PropAttributeStateEnm::SET);
        return Attribute(attribute, value, plain ? mdl_GivenEnm::VALUE : mdl_GivenEnm::AS_IT_STANDS);
    }
    case cls_FieldKind::Tree: break;
    }
    return py::none();
}

py::dict pyx_Values::FieldsOf(const cls_Record& record, const cls_Record& byDefault) const {
    py::dict values;
    for (const cls_Field& field : record.DynFields().All()) {
        if (field.type->Kind() == cls_FieldKind::Tree || field.notModelData) continue;
        if (!field.required && mdf_IsDefault(field, record, byDefault)) continue;
        values[field.name] = Of(*field.type, field.In(record));
    }
    return values;
}

py::object pyx_Values::State(const kprC_PropagatingObject&, const mdl_GivenState& given) const {
    py::dict values;
    if (given.deactivated) values["deactivated"] = true;
    if (given.status) {
        values["status"] =
            Member(omu_EnumTableOf(mdl_PropagationStatusEnm()), static_cast<int>(*given.status));
    }
    const cls_Record& record = given.record.ConstGet();
    const auto& fields = record.DynFields().All();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const mdl_GivenEnm mark = given.marks[i];
        if (mark == mdl_GivenEnm::ABSENT) continue;
        const void* value = fields[i].In(record);
        values[fields[i].name] =
            fields[i].type->Kind() == cls_FieldKind::Attribute
                ? Attribute(static_cast<const cls_AttributeType&>(*fields[i].type), value, mark)
                : Of(*fields[i].type, value);
    }
    return pyx_Hooks::Get().record(cls_Classes().NameOf(record.DynTypeId()).CStr(), values);
}

py::object pyx_Values::Record(const cls_Record& record) const {
    const cls_ClassEntry& entry = *cls_Classes().Find(record.DynTypeId());
    const std::unique_ptr<cls_Record> byDefault(entry.create());
    py::dict values = FieldsOf(record, *byDefault);
    if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(&record)) {
        py::dict states;
        for (const mdl_GivenState& given : object->GivenStates())
            states[Text(given.stepName)] = State(*object, given);
        if (!states.empty()) values["states"] = states;
    }
    return pyx_Hooks::Get().record(entry.info.name, values);
}
