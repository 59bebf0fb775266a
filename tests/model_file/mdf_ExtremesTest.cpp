// Every number of every record at its extremes: it survives being written and read again, and no rule that
// looks at it overflows.
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_RecordReader.h"
#include "model_file/mdf_RecordWriter.h"
#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/model/odb_Odb.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <sstream>

namespace {

using Record = std::unique_ptr<cls_Record>;

constexpr int kInts[] = {std::numeric_limits<int>::min(),     std::numeric_limits<int>::min() + 1, -1, 0, 1,
                         std::numeric_limits<int>::max() - 1, std::numeric_limits<int>::max()};
constexpr double kReals[] = {-0.0,
                             0.0,
                             std::numeric_limits<double>::max(),
                             -std::numeric_limits<double>::max(),
                             std::numeric_limits<double>::denorm_min(),
                             0.1,
                             2147483648.0};
constexpr float kFloats[] = {-0.0F, std::numeric_limits<float>::max(),
                             -std::numeric_limits<float>::denorm_min()};
constexpr std::size_t kVariants = 7;

/// Puts the n-th extreme into all numbers of the value.
bool Fill(const cls_FieldType& type, void* value, std::size_t n) {
    const double real = kReals[n % std::size(kReals)];
    // Lengths and axes are held in single precision by some.
    const double moderate = n % 2 == 0 ? -0.0 : 0.5;
    switch (type.Kind()) {
    case cls_FieldKind::Int: *static_cast<int*>(value) = kInts[n % std::size(kInts)]; return true;
    case cls_FieldKind::Double: *static_cast<double*>(value) = real; return true;
    case cls_FieldKind::Float: *static_cast<float*>(value) = kFloats[n % std::size(kFloats)]; return true;
    case cls_FieldKind::Triple: {
        const double xyz[3] = {moderate, -0.0, 0.0};
        static_cast<const cls_TripleType&>(type).Set(value, xyz);
        return true;
    }
    case cls_FieldKind::Segment:
        *static_cast<gsl_ModelSegment*>(value) =
            gsl_ModelSegment(gsl_Point(moderate, -0.0, 0.0), gsl_Point(0.0, -0.0, moderate));
        return true;
    case cls_FieldKind::Complex:
        static_cast<omi_complex*>(value)->real = real;
        static_cast<omi_complex*>(value)->imag = -0.0;
        return true;
    case cls_FieldKind::Table: {
        cow_2DArray<double> cells(1, 2);
        cells.Put(0, 0, real);
        cells.Put(0, 1, -0.0);
        static_cast<const cls_TableType&>(type).Set(value, cells);
        return true;
    }
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        list.Clear(value);
        return Fill(list.ItemType(), list.Append(value), n);
    }
    case cls_FieldKind::Attribute: {
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        attribute.SetState(value, 1);
        return Fill(attribute.ValueType(), attribute.WritableValue(value), n);
    }
    default: return false;
    }
}

/// Calls for a record of every class, and for states.
void ForEachRecord(const std::function<void(const std::string&, const std::function<Record()>&)>& call) {
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(cls_Record::TypeId())) {
        const auto create = [entry] { return Record(entry->create()); };
        call(entry->info.name, create);
        const Record made = create();
        const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(made.get());
        if (object != nullptr) {
            call(std::string("state of ") + entry->info.name, [&] { return Record(object->NewState(0)); });
        }
    }
}

/// The field of the record as a document, whatever its value.
std::string Written(const cls_Record& record, const cls_Field& field) {
    const odiK_Model none("M");
    std::ostringstream text;
    mdf_Writer out(text);
    out.BeginObject();
    mdf_RecordWriter(out, none).WriteMember(field, record);
    out.EndObject();
    EXPECT_TRUE(out.Finish());
    return text.str();
}

/// What a file gets that holds the field unless it has its default.
std::string InFile(const cls_Record& record, const cls_Field& field, const cls_Record& byDefault) {
    const odiK_Model none("M");
    std::ostringstream text;
    mdf_Writer out(text);
    out.BeginObject();
    mdf_RecordWriter(out, none).WriteField(field, record, byDefault);
    out.EndObject();
    EXPECT_TRUE(out.Finish());
    return text.str();
}

TEST(Extremes, EveryNumber_SurvivesBeingWrittenAndReadAgain) {
    int fields = 0;
    ForEachRecord([&](const std::string& name, const std::function<Record()>& create) {
        const Record sample = create();
        for (const cls_Field& field : sample->DynFields().All()) {
            if (field.notModelData || field.length > 1) continue;
            for (std::size_t n = 0; n < kVariants; ++n) {
                const Record record = create();
                if (!Fill(*field.type, field.In(*record), n)) continue;
                SCOPED_TRACE(name + "." + field.name + ": " + Written(*record, field));
                ++fields;
                mdf_Value json;
                std::vector<fnd_Finding> errors;
                ASSERT_TRUE(mdf_Parse(InFile(*record, field, *sample), json, errors));
                odiK_Model model("M");
                mdf_Report report;
                mdf_Diagnostics diagnostics(report);
                mdf_RecordReader reader(model, diagnostics);
                const Record again = create();
                reader.ReadField(*again, field, json.Find(field.name), fnd_Path());
                ASSERT_FALSE(report.HasErrors()) << report.Line(report.findings[0]);
                if (field.defaultItems != nullptr) continue; // completed when all fields are read
                EXPECT_EQ(Written(*again, field), Written(*record, field));
            }
        }
    });
    EXPECT_GT(fields, 4000);
}

TEST(Extremes, EveryNumber_IsLookedAtByTheRulesWithoutAnOverflow) {
    int findings = 0;
    ForEachRecord([&](const std::string& name, const std::function<Record()>& create) {
        SCOPED_TRACE(name);
        for (std::size_t n = 0; n < kVariants; ++n) {
            // One number at a time, then all at once.
            const Record all = create();
            for (const cls_Field& field : all->DynFields().All()) {
                const Record one = create();
                if (!Fill(*field.type, field.In(*one), n)) continue;
                Fill(*field.type, field.In(*all), n);
                fnd_List list;
                const fnd_Path place;
                fnd_RecordCheck check(list, place);
                fnd_RecordRules::All().Run(*one, check);
                fnd_RecordRules::All().TableHint(*one, field.name);
                findings += static_cast<int>(list.findings.size());
            }
            fnd_List list;
            const fnd_Path place;
            fnd_RecordCheck check(list, place);
            fnd_RecordRules::All().Run(*all, check);
            for (const cls_Field& field : all->DynFields().All()) {
                fnd_RecordRules::All().TableHint(*all, field.name);
            }
        }
    });
    EXPECT_GT(findings, 500);
}

} // namespace
