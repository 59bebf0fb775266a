#ifndef QRX_TESTS_CONDITIONS_LOADTESTING_H
#define QRX_TESTS_CONDITIONS_LOADTESTING_H

#include "conditions/ConditionTesting.h"

/// A model with one load "L" or one field "F", of the class and with the states, in steps by their letters.
class OneLoad : public ConditionModel {
public:
    OneLoad(std::string_view steps, const std::string& className, const std::string& states,
            const std::string& fields = "", const std::string& region = "A.N")
        : ConditionModel(steps, R"("loads": {"L": {"class": "kloC_)" + className + "\"" +
                                    (fields.empty() ? "" : ", " + fields) + R"(, "region": ")" + region +
                                    R"(", "states": {)" + states + "}}}") {}
    const kloC_Load& Record() const { return Store().loads.ConstGet("L"); }
};

class OneField : public ConditionModel {
public:
    OneField(std::string_view steps, const std::string& className, const std::string& states,
             const std::string& fields = "")
        : ConditionModel(steps, R"("fields": {"F": {"class": "kpfC_)" + className + "\"" +
                                    (fields.empty() ? "" : ", " + fields) +
                                    R"(, "region": "A.N", "states": {)" + states + "}}}") {}
    const kpfC_Field& Record() const { return Store().fields.ConstGet("F"); }
};

/// What the builder files for a step or one of its load cases.
template <class Builder>
std::string StepText(ConditionModel& model, const char* step, const char* loadCase = "") {
    Builder builder(model.Info());
    builder.Build();
    const qkw_KeywordList keywords = builder.StepDefinition(step, loadCase);
    std::string text;
    for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    return text;
}

#endif
