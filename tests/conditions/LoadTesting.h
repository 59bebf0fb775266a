#ifndef QRX_TESTS_CONDITIONS_LOADTESTING_H
#define QRX_TESTS_CONDITIONS_LOADTESTING_H

#include "conditions/ConditionTesting.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"

/// A model with one load "L" or one field "F", of the class and with the states, in steps by their letters.
class OneLoad : public ConditionModel {
public:
    OneLoad(std::string_view steps, const std::string& className, const std::string& states,
            const std::string& fields = "", const std::string& region = "A.N")
        : ConditionModel(steps, R"("loads": {"L": {"class": "kloC_)" + className + "\"" +
                                    (fields.empty() ? "" : ", " + fields) + R"(, "region": ")" + region +
                                    R"(", "states": {)" + states + "}}}") {}
    const kloC_Load& Record() const { return Store().loads.ConstGet("L"); }
    oif_LoadCard Card(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0,
                      const char* setName = "A.N") const {
        return {"L", Record(), setName, step, op, {}, static_cast<float>(scale)};
    }
    /// The keyword that the row of the load's class makes.
    std::string Text(const oif_LoadCard& card, std::optional<int> cyclicMode = {}, int space = 1) {
        const oif_LoadRow* row = oif_FindLoadRow(Record().DynTypeId());
        return Written(row->make(card, {Info(), cyclicMode, space}).ConstGet());
    }
};

class OneField : public ConditionModel {
public:
    OneField(std::string_view steps, const std::string& className, const std::string& states,
             const std::string& fields = "")
        : ConditionModel(steps, R"("fields": {"F": {"class": "kpfC_)" + className + "\"" +
                                    (fields.empty() ? "" : ", " + fields) +
                                    R"(, "region": "A.N", "states": {)" + states + "}}}") {}
    const kpfC_Field& Record() const { return Store().fields.ConstGet("F"); }
    oif_FieldCard Card(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0) const {
        return {"F", Record(), "A.N", step, op, {}, static_cast<float>(scale)};
    }
};

/// What the builder files for a step or one of its load cases.
template <class Builder>
std::string StepText(ConditionModel& model, const char* step, const char* loadCase = "") {
    Builder builder(model.Info());
    builder.Build();
    return WrittenAll(builder.StepDefinition(step, loadCase));
}

#endif
