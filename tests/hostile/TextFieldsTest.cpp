// Every text of every record: none may begin a line of a deck but those that are deck text by design.
#include "hostile/Findings.h"
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_RecordReader.h"
#include "store_interface/model/odb_Odb.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <functional>
#include <set>
#include <sstream>

namespace {

constexpr const char* kInjections[] = {"x\\n*INJECTED", "x\\r*INJECTED", "\\u0000", "a\\u001b[2J", "\\u007f"};

/// What of a field holds texts, as JSON around one.
std::vector<std::string> ShapesOf(const cls_FieldType& type) {
    std::vector<std::string> shapes;
    const auto within = [&shapes](const cls_FieldType& inner, const std::string& head,
                                  const std::string& tail) {
        for (const std::string& shape : ShapesOf(inner)) shapes.push_back(head + shape + tail);
    };
    switch (type.Kind()) {
    case cls_FieldKind::String: return {"\"@\""};
    case cls_FieldKind::Region: return {"\"@\"", R"({"instance": "@", "set": "x"})", R"({"set": "@"})"};
    case cls_FieldKind::Datum: return {"\"@\""};
    case cls_FieldKind::Enum: return {"\"@\""};
    case cls_FieldKind::List: within(static_cast<const cls_ListType&>(type).ItemType(), "[", "]"); break;
    case cls_FieldKind::Map: {
        const auto& map = static_cast<const cls_MapType&>(type);
        within(map.ItemType(), "{\"x\": ", "}");
        const cls_FieldKind item = map.ItemType().Kind();
        const bool isNumber = item == cls_FieldKind::Float || item == cls_FieldKind::Double;
        shapes.push_back(isNumber ? "{\"@\": 1}" : "{\"@\": {}}");
        break;
    }
    case cls_FieldKind::Attribute: {
        const auto& value = static_cast<const cls_AttributeType&>(type).ValueType();
        within(value, "", "");
        within(value, "{\"value\": ", ", \"state\": \"SET\"}");
        break;
    }
    // Records within records are asked as classes of their own.
    default: break;
    }
    return shapes;
}

std::string With(std::string shape, const std::string& text) {
    return shape.replace(shape.find('@'), 1, text);
}

/// Errors of reading the record from an object with this one member.
std::size_t ErrorsOf(cls_Record& record, const std::string& member, const std::string& value) {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel("M");
    mdf_Report report;
    mdf_Diagnostics diagnostics(report);
    mdf_RecordReader reader(model, diagnostics);
    mdf_Value json;
    std::vector<fnd_Finding> errors;
    EXPECT_TRUE(mdf_Parse("{\"" + member + "\": " + value + "}", json, errors)) << value;
    const cls_Field& field = *record.DynFields().Find(member);
    reader.ReadField(record, field, json.Find(member), fnd_Path(fnd_Path(), std::string_view(field.name)));
    reader.References().Check();
    return static_cast<std::size_t>(std::count_if(report.findings.begin(), report.findings.end(),
                                                  [](const auto& f) { return f.IsError(); }));
}

/// Calls for one record of every class there is, of states and of the frame too.
void ForEachRecord(const std::function<void(const std::string& name,
                                            const std::function<std::unique_ptr<cls_Record>()>&)>& call) {
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(cls_Record::TypeId())) {
        const auto create = [entry] { return std::unique_ptr<cls_Record>(entry->create()); };
        call(entry->info.name, create);
        const auto made = create();
        const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(made.get());
        if (object == nullptr) continue;
        call(std::string("state of ") + entry->info.name,
             [&] { return std::unique_ptr<cls_Record>(object->NewState(0)); });
    }
    call("odiK_ModelData", [] { return std::unique_ptr<cls_Record>(odiK_ModelData().Copy()); });
    call("odiK_Part", [] { return std::unique_ptr<cls_Record>(odiK_Part().Copy()); });
    call("odiK_Instance", [] { return std::unique_ptr<cls_Record>(odiK_Instance().Copy()); });
    call("odiK_Assembly", [] { return std::unique_ptr<cls_Record>(odiK_Assembly().Copy()); });
    call("odiK_Datum", [] { return std::unique_ptr<cls_Record>(odiK_Datum().Copy()); });
    call("odiK_SetHead", [] { return std::unique_ptr<cls_Record>(odiK_SetHead().Copy()); });
}

} // namespace

TEST(TextFields, ControlCharacters_AreRefusedInAllButDeckTextAndDescriptions) {
    std::set<std::string> asTheyStand;
    int fields = 0;
    ForEachRecord([&](const std::string& name, const auto& create) {
        const auto sample = create();
        for (const cls_Field& field : sample->DynFields().All()) {
            if (field.notModelData) continue;
            if (field.verbatim || field.freeText) {
                asTheyStand.insert(field.name);
                continue;
            }
            for (const std::string& shape : ShapesOf(*field.type)) {
                ++fields;
                for (const char* text : kInjections) {
                    EXPECT_GT(ErrorsOf(*create(), field.name, With(shape, text)), 0U)
                        << name << "." << field.name << ": " << With(shape, text);
                }
            }
        }
    });
    EXPECT_GT(fields, 400);
    EXPECT_EQ(asTheyStand,
              (std::set<std::string>{"description", "reason", "solverInput", "topLevelSolverInput"}));
}

namespace {

std::string StepsWith(const std::string& description) {
    return Model(R"("steps": [{"name": "Initial", "class": "InitialStep"},
        {"name": "S", "class": "StaticStep", "description": ")" +
                 description + "\"}]");
}

std::string SetsOf(const std::string& names) {
    return Model(R"("parts": {"P": {"mesh": {"nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
                                             "sets": [{"name": "N", "kind": "node", "labels": [1]}]}}},
        "assembly": {"instances": {"A.B": {"part": "P"}}},
        "steps": [{"name": "Initial", "class": "InitialStep"},
                  {"name": "S", "class": "FREQUENCYSTEP", "residualModeSets": [)" +
                 names + "]}]");
}

const std::string kKeywordAt = "warning @/steps/1/description: found the line ";

const FindingCase cases[] = {
    {"OutputFilter",
     Model(R"("historyOutputRequests": {"H": {"filter": "f\n*STEP"}})"),
     {"@/historyOutputRequests/H/filter: found a text with a control character, expected a text that can "
      "stand "
      "on one line of a deck"}},
    {"DescriptionOfOneLine", StepsWith("pull it"), {}},
    {"DescriptionWithAKeyword",
     StepsWith("pull\\n *Boundary, op=NEW\\nit"),
     {kKeywordAt + "' *Boundary, op=NEW', which will be read as a keyword"}},
    {"DescriptionThatIsAKeyword",
     StepsWith("*Static"),
     {kKeywordAt + "'*Static', which will be read as a keyword"}},
    {"DescriptionWithAComment", StepsWith("pull\\n** it"), {}},
    {"SetOfAnInstanceInQuotes",
     SetsOf(R"("\"A.B\".N", "A.B.N", "\"A.B\".x")"),
     {"@/steps/1/residualModeSets/2: found '\"A.B\".x', expected the name of a set; there is 'A.B.N'"}},
    {"ElementType",
     Mesh(R"("nodes": {"labels": [1], "coordinates": [[0, 0, 0]]},
             "elements": [{"type": "MASS\n*STEP", "labels": [1], "connectivity": [[1]]}])"),
     {"@/parts/P/mesh/elements/0/type: found a name with a control character, expected a name that can stand "
      "in "
      "a deck"}},
};

class TextFieldsOfModels : public testing::TestWithParam<FindingCase> {};

} // namespace

TEST_P(TextFieldsOfModels, AreCheckedWhereTheyStand) {
    EXPECT_EQ(Findings(GetParam().text), GetParam().findings);
}

INSTANTIATE_TEST_SUITE_P(Cases, TextFieldsOfModels, testing::ValuesIn(cases), FindingCaseName);
