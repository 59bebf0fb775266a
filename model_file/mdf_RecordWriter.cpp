#include "model_file/mdf_RecordWriter.h"

#include "model_file/mdf_Members.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <cmath>

namespace {

bool SameSign(double a, double b) {
    return std::signbit(a) == std::signbit(b);
}

/// Whether two equal values have the same signs of zero too, so that one can stand for the other in a file.
bool SameZeros(const cls_FieldType& type, const void* a, const void* b);

bool SameZeros(const cls_Record& a, const cls_Record& b) {
    for (const cls_Field& field : a.DynFields().All()) {
        if (!SameZeros(*field.type, field.In(a), field.In(b))) return false;
    }
    return true;
}

bool SameZeros(const cow_2DArray<double>& a, const cow_2DArray<double>& b) {
    for (int i = 0; i < a.NumRows(); ++i) {
        for (int j = 0; j < a.NumColumns(); ++j) {
            if (!SameSign(a.ConstGet(i, j), b.ConstGet(i, j))) return false;
        }
    }
    return true;
}

bool SameZeros(const cls_FieldType& type, const void* a, const void* b) {
    switch (type.Kind()) {
    case cls_FieldKind::Double:
        return SameSign(*static_cast<const double*>(a), *static_cast<const double*>(b));
    case cls_FieldKind::Float: return SameSign(*static_cast<const float*>(a), *static_cast<const float*>(b));
    case cls_FieldKind::Triple: {
        double first[3];
        double second[3];
        static_cast<const cls_TripleType&>(type).Get(a, first);
        static_cast<const cls_TripleType&>(type).Get(b, second);
        return SameSign(first[0], second[0]) && SameSign(first[1], second[1]) &&
               SameSign(first[2], second[2]);
    }
    case cls_FieldKind::Complex: {
        const auto& first = *static_cast<const omi_complex*>(a);
        const auto& second = *static_cast<const omi_complex*>(b);
        return SameSign(first.real, second.real) && SameSign(first.imag, second.imag);
    }
    case cls_FieldKind::Segment: {
        const auto& first = *static_cast<const gsl_ModelSegment*>(a);
        const auto& second = *static_cast<const gsl_ModelSegment*>(b);
        const cls_FieldType& point = cls_TypeOf<gsl_Point>::Instance();
        return SameZeros(point, &first.Start(), &second.Start()) &&
               SameZeros(point, &first.End(), &second.End());
    }
    case cls_FieldKind::Table: {
        const auto& table = static_cast<const cls_TableType&>(type);
        return SameZeros(table.Get(a), table.Get(b));
    }
    case cls_FieldKind::Map: {
        const auto& map = static_cast<const cls_MapType&>(type);
        for (const cow_String& key : map.Keys(a)) {
            if (!SameZeros(map.ItemType(), map.Item(a, key), map.Item(b, key))) return false;
        }
        return true;
    }
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        return SameZeros(attribute.ValueType(), attribute.Value(a), attribute.Value(b));
    }
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        for (int i = 0; i < list.Length(a); ++i) {
            if (!SameZeros(list.ItemType(), list.Item(a, i), list.Item(b, i))) return false;
        }
        return true;
    }
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: {
        const auto& holder = static_cast<const cls_HolderType&>(type);
        return holder.Get(a) == nullptr || SameZeros(*holder.Get(a), *holder.Get(b));
    }
    default: return true;
    }
}

/// Lists of such items stand in lines as long as they fit.
bool IsShort(const cls_FieldType& type) {
    switch (type.Kind()) {
    case cls_FieldKind::Bool:
    case cls_FieldKind::Int:
    case cls_FieldKind::Double:
    case cls_FieldKind::Float:
    case cls_FieldKind::String:
    case cls_FieldKind::Enum: return true;
    default: return false;
    }
}

} // namespace

bool mdf_IsDefault(const cls_Field& field, const cls_Record& record, const cls_Record& byDefault) {
    const void* value = field.In(record);
    if (field.defaultItems == nullptr)
        return field.type->Equal(value, field.In(byDefault)) &&
               SameZeros(*field.type, value, field.In(byDefault));
    const cow_List<double> items = field.defaultItems(record);
    return *static_cast<const cow_List<double>*>(value) == items && SameZeros(*field.type, value, &items);
}

void mdf_RecordWriter::WriteFields(const cls_Record& record, std::string_view passedOver) {
    const std::unique_ptr<cls_Record> byDefault(cls_Classes().Find(record.DynTypeId())->create());
    for (const cls_Field& field : record.DynFields().All()) {
        if (passedOver != field.name) WriteField(field, record, *byDefault);
    }
}

void mdf_RecordWriter::WriteField(const cls_Field& field, const cls_Record& record,
                                  const cls_Record& byDefault) {
    if (field.notModelData) return;
    if (field.required || !mdf_IsDefault(field, record, byDefault)) WriteMember(field, record);
}

void mdf_RecordWriter::WriteMember(const cls_Field& field, const cls_Record& record) {
    out_.Key(field.name);
    const std::string word = field.meanings.empty()
                                 ? std::string()
                                 : mdf_WordOfNumber(field, *static_cast<const int*>(field.In(record)));
    if (!word.empty()) {
        out_.String(word);
    } else if (field.verbatim) {
        WriteText(static_cast<const cow_String*>(field.In(record))->View());
    } else {
        WriteValue(*field.type, field.In(record));
    }
}

/// Deck text as its lines, if each is ended.
void mdf_RecordWriter::WriteText(std::string_view text) {
    if (!text.ends_with('\n')) {
        out_.String(text);
        return;
    }
    out_.BeginArray(text.find('\n') + 1 == text.size() ? mdf_Layout::OneLine : mdf_Layout::Lines);
    while (!text.empty()) {
        const std::size_t end = text.find('\n');
        out_.String(text.substr(0, end));
        text.remove_prefix(end + 1);
    }
    out_.EndArray();
}

void mdf_RecordWriter::WriteRecord(const cls_Record& record, unsigned base) {
    out_.BeginObject();
    if (record.DynTypeId() != base) WriteClass(record);
    WriteFields(record);
    if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(&record)) WriteStates(*object);
    out_.EndObject();
}

void mdf_RecordWriter::WriteClass(const cls_Record& record) {
    out_.Key("class");
    out_.String(cls_Classes().ShortNameOf(record.DynTypeId()).View());
}

void mdf_RecordWriter::WriteStates(const kprC_PropagatingObject& object) {
    if (object.GivenStates().empty()) return;
    out_.Key("states");
    out_.BeginObject();
    for (const mdl_GivenState& given : object.GivenStates()) {
        out_.Key(given.stepName.View());
        WriteState(given);
    }
    out_.EndObject();
}

void mdf_RecordWriter::WriteState(const mdl_GivenState& given) {
    out_.BeginObject();
    if (given.deactivated) {
        out_.Key("deactivated");
        out_.Bool(true);
    }
    if (given.status) {
        out_.Key("status");
        WriteValue(cls_TypeOf<mdl_PropagationStatusEnm>::Instance(), &*given.status);
    }
    const cls_Record& record = given.record.ConstGet();
    const auto& fields = record.DynFields().All();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (given.marks[i] == mdl_GivenEnm::ABSENT) continue;
        out_.Key(fields[i].name);
        if (given.marks[i] == mdl_GivenEnm::CLEARED) {
            out_.Null();
        } else {
            WriteGiven(*fields[i].type, fields[i].In(record), given.marks[i]);
        }
    }
    out_.EndObject();
}

void mdf_RecordWriter::WriteGiven(const cls_FieldType& type, const void* value, mdl_GivenEnm mark) {
    if (type.Kind() != cls_FieldKind::Attribute) {
        WriteValue(type, value);
        return;
    }
    const auto& attribute = static_cast<const cls_AttributeType&>(type);
    if (mark == mdl_GivenEnm::VALUE) {
        WriteValue(attribute.ValueType(), attribute.Value(value));
        return;
    }
    out_.BeginObject();
    if (mark != mdl_GivenEnm::STATE_ONLY) {
        out_.Key("value");
        WriteValue(attribute.ValueType(), attribute.Value(value));
    }
    out_.Key("state");
    WriteEnum(static_cast<const cls_EnumType&>(cls_TypeOf<mdl_PropAttributeStateEnm>::Instance()),
              attribute.State(value));
    out_.EndObject();
}

void mdf_RecordWriter::WriteValue(const cls_FieldType& type, const void* value) {
    // The marker of a number without a value is a number too: where null may stand, the marker is the
    // default.
    switch (type.Kind()) {
    case cls_FieldKind::Bool: out_.Bool(*static_cast<const bool*>(value)); break;
    case cls_FieldKind::Int: out_.Int(*static_cast<const int*>(value)); break;
    case cls_FieldKind::Double: out_.Real(*static_cast<const double*>(value)); break;
    case cls_FieldKind::Float: out_.Real(*static_cast<const float*>(value)); break;
    case cls_FieldKind::String: out_.String(static_cast<const cow_String*>(value)->View()); break;
    case cls_FieldKind::Enum: {
        const auto& enumeration = static_cast<const cls_EnumType&>(type);
        WriteEnum(enumeration, enumeration.Get(value));
        break;
    }
    case cls_FieldKind::Triple: {
        const auto& triple = static_cast<const cls_TripleType&>(type);
        double xyz[3];
        triple.Get(value, xyz);
        out_.BeginArray(mdf_Layout::OneLine);
        for (const double number : xyz) {
            if (triple.IsSingle()) {
                out_.Real(static_cast<float>(number));
            } else {
                out_.Real(number);
            }
        }
        out_.EndArray();
        break;
    }
    case cls_FieldKind::Segment: {
        const auto& segment = *static_cast<const gsl_ModelSegment*>(value);
        out_.BeginArray(mdf_Layout::OneLine);
        WriteValue(cls_TypeOf<gsl_Point>::Instance(), &segment.Start());
        WriteValue(cls_TypeOf<gsl_Point>::Instance(), &segment.End());
        out_.EndArray();
        break;
    }
    case cls_FieldKind::Complex: WriteComplex(*static_cast<const omi_complex*>(value)); break;
    case cls_FieldKind::Table: WriteTable(static_cast<const cls_TableType&>(type).Get(value)); break;
    case cls_FieldKind::List: WriteList(static_cast<const cls_ListType&>(type), value); break;
    case cls_FieldKind::Map: WriteMap(static_cast<const cls_MapType&>(type), value); break;
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: WriteHolder(static_cast<const cls_HolderType&>(type), value); break;
    case cls_FieldKind::Region: WriteRegion(*static_cast<const rgnC_Region*>(value)); break;
    case cls_FieldKind::Datum: WriteDatum(*static_cast<const dtmC_DatumRef*>(value)); break;
    case cls_FieldKind::Attribute: {
        // An item of a list of attributes: its state says whether it was set.
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        const bool plain = attribute.State(value) == static_cast<int>(mdl_PropAttributeStateEnm::SET);
        WriteGiven(type, value, plain ? mdl_GivenEnm::VALUE : mdl_GivenEnm::AS_IT_STANDS);
        break;
    }
    case cls_FieldKind::Tree: break;
    }
}

void mdf_RecordWriter::WriteEnum(const cls_EnumType& type, int number) {
    const omu_EnumRow* row = type.Table().Row(number);
    if (row == nullptr) {
        out_.Int(number);
    } else {
        out_.String(row->name);
    }
}

void mdf_RecordWriter::WriteComplex(const omi_complex& number) {
    const double parts[2] = {number.real, number.imag};
    if (number.form == omi_complex::FormEnm::RECTANGULAR) {
        out_.Row(std::span<const double>(parts));
        return;
    }
    out_.BeginObject(mdf_Layout::OneLine);
    out_.Key("form");
    WriteValue(cls_TypeOf<omi_complex::FormEnm>::Instance(), &number.form);
    out_.Key("real");
    out_.Real(number.real);
    out_.Key("imag");
    out_.Real(number.imag);
    out_.EndObject();
}

void mdf_RecordWriter::WriteTable(const cow_2DArray<double>& cells) {
    out_.BeginArray(cells.NumRows() == 1 ? mdf_Layout::OneLine : mdf_Layout::Lines);
    for (int row = 0; row < cells.NumRows(); ++row) {
        out_.Row(std::span<const double>(cells.ConstRow(row), static_cast<std::size_t>(cells.NumColumns())));
    }
    out_.EndArray();
}

void mdf_RecordWriter::WriteList(const cls_ListType& type, const void* value) {
    out_.BeginArray(IsShort(type.ItemType()) ? mdf_Layout::Wrapped : mdf_Layout::Lines);
    for (int i = 0; i < type.Length(value); ++i) WriteValue(type.ItemType(), type.Item(value, i));
    out_.EndArray();
}

void mdf_RecordWriter::WriteMap(const cls_MapType& type, const void* value) {
    out_.BeginObject();
    for (const cow_String& key : type.Keys(value)) {
        out_.Key(key.View());
        WriteValue(type.ItemType(), type.Item(value, key));
    }
    out_.EndObject();
}

void mdf_RecordWriter::WriteHolder(const cls_HolderType& type, const void* value) {
    const cls_Record* record = type.Get(value);
    if (record == nullptr) {
        out_.Null();
    } else {
        // A variant says its class, also when that is the one that its record must derive from.
        WriteRecord(*record, type.Kind() == cls_FieldKind::Variant ? 0 : record->DynTypeId());
    }
}

void mdf_RecordWriter::WriteRegion(const rgnC_Region& region) {
    const std::string instance(region.InstanceName().View());
    const std::string set(region.SetName().View());
    if (!region.HasValue()) {
        out_.Null();
    } else if (instance.find('.') == std::string::npos && set.find('.') == std::string::npos) {
        out_.String(instance.empty() ? set : instance + "." + set);
    } else {
        out_.BeginObject(mdf_Layout::OneLine);
        if (!instance.empty()) {
            out_.Key("instance");
            out_.String(instance);
        }
        out_.Key("set");
        out_.String(set);
        out_.EndObject();
    }
}

void mdf_RecordWriter::WriteDatum(const dtmC_DatumRef& datum) {
    if (datum.IsNullRef()) {
        out_.Null();
    } else {
        out_.String(model_.Datums().at(static_cast<std::size_t>(datum.Id()) - 1).name.View());
    }
}
