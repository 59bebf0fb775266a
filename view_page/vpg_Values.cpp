#include "view_page/vpg_Values.h"

#include "store_interface/propagation/mdl_PropAttr.h"

using nlohmann::ordered_json;

namespace {

/// Tables and lists are shown as far as this.
constexpr int kMaxRows = 40;

template <class T>
const T& As(const void* value) {
    return *static_cast<const T*>(value);
}

ordered_json Triple(const gsl_Point& point) {
    return {point.X(), point.Y(), point.Z()};
}

ordered_json Value(const cls_FieldType& type, const void* value);

ordered_json RecordValue(const cls_Record* record) {
    if (record == nullptr) return nullptr;
    ordered_json object = ordered_json::object();
    for (const cls_Field& field : record->DynFields().All()) {
        if (!cls_IsUnset(*field.type, field.In(*record))) object[field.name] = vpg_ValueOf(field, *record);
    }
    return object;
}

ordered_json TableValue(const cow_2DArray<double>& table) {
    ordered_json rows = ordered_json::array();
    for (int i = 0; i < std::min(table.NumRows(), kMaxRows); ++i) {
        ordered_json row = ordered_json::array();
        for (int k = 0; k < table.NumColumns(); ++k) row.push_back(table.ConstGet(i, k));
        rows.push_back(std::move(row));
    }
    if (table.NumRows() > kMaxRows) rows.push_back("...");
    return rows;
}

ordered_json ListValue(const cls_ListType& list, const void* value) {
    ordered_json items = ordered_json::array();
    for (int i = 0; i < std::min(list.Length(value), kMaxRows); ++i) {
        items.push_back(Value(list.ItemType(), list.Item(value, i)));
    }
    if (list.Length(value) > kMaxRows) items.push_back("...");
    return items;
}

ordered_json MapValue(const cls_MapType& map, const void* value) {
    ordered_json items = ordered_json::object();
    for (const cow_String& key : map.Keys(value)) {
        items[vpg_Text(key)] = Value(map.ItemType(), map.Item(value, key));
    }
    return items;
}

ordered_json TripleValue(const cls_TripleType& type, const void* value) {
    double xyz[3];
    type.Get(value, xyz);
    return {xyz[0], xyz[1], xyz[2]};
}

ordered_json EnumValue(const cls_EnumType& type, const void* value) {
    const int number = type.Get(value);
    const omu_EnumRow* row = type.Table().Row(number);
    if (row == nullptr) return number;
    return row->name;
}

ordered_json Value(const cls_FieldType& type, const void* value) {
    if (value == nullptr || cls_IsUnset(type, value)) return nullptr;
    switch (type.Kind()) {
    case cls_FieldKind::Bool: return As<bool>(value);
    case cls_FieldKind::Int: return As<int>(value);
    case cls_FieldKind::Double: return As<double>(value);
    case cls_FieldKind::Float: return As<float>(value);
    case cls_FieldKind::String: return vpg_Text(As<cow_String>(value));
    case cls_FieldKind::Enum: return EnumValue(static_cast<const cls_EnumType&>(type), value);
    case cls_FieldKind::Triple: return TripleValue(static_cast<const cls_TripleType&>(type), value);
    case cls_FieldKind::Segment:
        return {Triple(As<gsl_ModelSegment>(value).Start()), Triple(As<gsl_ModelSegment>(value).End())};
    case cls_FieldKind::Complex: return {As<omi_complex>(value).real, As<omi_complex>(value).imag};
    case cls_FieldKind::Table: return TableValue(static_cast<const cls_TableType&>(type).Get(value));
    case cls_FieldKind::List: return ListValue(static_cast<const cls_ListType&>(type), value);
    case cls_FieldKind::Map: return MapValue(static_cast<const cls_MapType&>(type), value);
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: return RecordValue(static_cast<const cls_HolderType&>(type).Get(value));
    case cls_FieldKind::Region: {
        const auto& region = As<rgnC_Region>(value);
        const std::string owner = vpg_Text(region.InstanceName());
        return (owner.empty() ? owner : owner + ".") + vpg_Text(region.SetName());
    }
    case cls_FieldKind::Datum: return As<dtmC_DatumRef>(value).Id();
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        return Value(attribute.ValueType(), attribute.Value(value));
    }
    case cls_FieldKind::Tree: return nullptr;
    }
    return nullptr;
}

bool IsInForce(const cls_AttributeType& type, const void* value) {
    const auto state = static_cast<mdl_PropAttributeStateEnm>(type.State(value));
    return state == mdl_PropAttributeStateEnm::SET || state == mdl_PropAttributeStateEnm::CARRIED;
}

bool SaysSomething(const cls_Field& field, const cls_Record& record, const cls_Record& byDefault) {
    const void* value = field.In(record);
    if (field.notModelData || value == nullptr) return false;
    if (field.type->Kind() == cls_FieldKind::Region || field.type->Kind() == cls_FieldKind::Tree)
        return false;
    if (field.type->Kind() == cls_FieldKind::Attribute) {
        return IsInForce(static_cast<const cls_AttributeType&>(*field.type), value);
    }
    return !field.type->Equal(value, field.In(byDefault));
}

using RegionVisit = std::function<void(const std::string&, const rgnC_Region&)>;

void VisitRegions(const std::string& role, const cls_FieldType& type, const void* value,
                  const RegionVisit& visit) {
    switch (type.Kind()) {
    case cls_FieldKind::Region:
        if (As<rgnC_Region>(value).HasValue()) visit(role, As<rgnC_Region>(value));
        return;
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        for (int i = 0; i < list.Length(value); ++i) {
            VisitRegions(role, list.ItemType(), list.Item(value, i), visit);
        }
        return;
    }
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        return VisitRegions(role, attribute.ValueType(), attribute.Value(value), visit);
    }
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: {
        const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
        if (record == nullptr) return;
        vpg_ForEachRegion(*record, [&](const std::string& inner, const rgnC_Region& region) {
            visit(role + "." + inner, region);
        });
        return;
    }
    default: return;
    }
}

} // namespace

ordered_json vpg_ValueOf(const cls_Field& field, const cls_Record& record) {
    const void* value = field.In(record);
    if (field.type->Kind() == cls_FieldKind::Int) {
        for (const cls_IntMeaning& meaning : field.meanings) {
            if (meaning.value == As<int>(value)) return meaning.word;
        }
    }
    return Value(*field.type, value);
}

ordered_json vpg_FieldsOf(const cls_Record& record, const cls_Record& byDefault) {
    ordered_json fields = ordered_json::array();
    for (const cls_Field& field : record.DynFields().All()) {
        if (!SaysSomething(field, record, byDefault)) continue;
        fields.push_back({{"name", field.name}, {"value", vpg_ValueOf(field, record)}, {"doc", field.doc}});
    }
    return fields;
}

void vpg_ForEachRegion(const cls_Record& record, const RegionVisit& visit) {
    for (const cls_Field& field : record.DynFields().All()) {
        if (!field.notModelData) VisitRegions(field.name, *field.type, field.In(record), visit);
    }
}

std::string vpg_Escaped(std::string_view text) {
    std::string escaped;
    for (const char c : text) {
        switch (c) {
        case '<': escaped += "&lt;"; break;
        case '>': escaped += "&gt;"; break;
        case '&': escaped += "&amp;"; break;
        case '"': escaped += "&quot;"; break;
        default: escaped += c;
        }
    }
    return escaped;
}
