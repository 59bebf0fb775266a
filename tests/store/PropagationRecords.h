#ifndef QRX_TESTS_STORE_PROPAGATIONRECORDS_H
#define QRX_TESTS_STORE_PROPAGATIONRECORDS_H

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/conditions/kpfC_Field.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "store_interface/records/output/korC_Output.h"

/// Small records of every family that lives across steps, and steps of any procedure.
namespace sample {

using Status = mdl_PropagationStatusEnm;
using State = mdl_PropAttributeStateEnm;
using Given = mdl_GivenEnm;

inline constexpr unsigned kStatic = 0x23C0073;
inline constexpr unsigned kFrequency = 0x23C006A;
inline constexpr unsigned kBuckle = 0x23C0066;

/// Copied like any record; only its number matters here.
template <unsigned Number>
class Step final : public cls_RecordOf<Step<Number>, kprC_AnalysisStep> {
public:
    static constexpr cls_ClassInfo Class{"sample_Step", "a step of a procedure", Number};
};

class ConditionState final : public cls_RecordOf<ConditionState, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"sample_ConditionState", "state of a displacement"};

    mdl_PropAttr<double> u1;
    mdl_PropAttr<double> u2;
    mdl_PropAttr<double> u3;
    mdl_PropAttr<cow_String> typeName;
    int buckleCase = 0;
    double u1Imag = 0.0;

    static const cls_FieldTable& Fields();
};

class Condition final : public cls_RecordOf<Condition, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"sample_Condition", "a displacement"};
    cls_Record* NewState(unsigned) const override { return new ConditionState(); }
};

enum class BoltMethodEnm : int { APPLY_FORCE = 0, ADJUST_LENGTH = 1, FIX_LENGTH = 2 };
const omu_EnumTable& omu_EnumTableOf(BoltMethodEnm);

class ForceState final : public cls_RecordOf<ForceState, kloC_LoadState> {
public:
    static constexpr cls_ClassInfo Class{"sample_ForceState", "state of a force"};

    mdl_PropAttr<double> magnitude;
    mdl_PropAttr<BoltMethodEnm> boltMethod;
    cow_String note;

    static const cls_FieldTable& Fields();
};

class Force final : public cls_RecordOf<Force, kloC_Load> {
public:
    static constexpr cls_ClassInfo Class{"sample_Force", "a force"};
    cls_Record* NewState(unsigned) const override { return new ForceState(); }
};

class TemperatureState final : public cls_RecordOf<TemperatureState, kpfC_FieldState> {
public:
    static constexpr cls_ClassInfo Class{"sample_TemperatureState", "state of a temperature"};

    cow_List<mdl_PropAttr<double>> values;

    static const cls_FieldTable& Fields();
};

class Temperature final : public cls_RecordOf<Temperature, kpfC_Field> {
public:
    static constexpr cls_ClassInfo Class{"sample_Temperature", "a temperature"};
    cls_Record* NewState(unsigned) const override { return new TemperatureState(); }
};

/// opDelete follows the status unless it is given.
class ContactState final : public cls_RecordOf<ContactState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"sample_ContactState", "state of a contact"};

    bool opDelete = false;
    mdl_PropAttr<double> friction;

    static const cls_FieldTable& Fields();
};

class Contact final : public cls_RecordOf<Contact, kinC_Interaction> {
public:
    static constexpr cls_ClassInfo Class{"sample_Contact", "a contact"};
    cls_Record* NewState(unsigned) const override { return new ContactState(); }

protected:
    void CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                       const mdl_GivenState* given) const override;
};

/// The frequency's default is 10 in a frequency step, 20 in a buckling step, else 1.
class RequestState final : public cls_RecordOf<RequestState, korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"sample_RequestState", "state of a request"};

    RequestState() : cls_RecordOf(0U, true) {}
    mdl_PropAttr<cow_String> variable;

    korC_OdbChannel::TypeEnm Channel() const override { return korC_OdbChannel::TypeEnm::FIELD; }

    static const cls_FieldTable& Fields();
};

class Request final : public cls_RecordOf<Request, korC_FieldOutput> {
public:
    static constexpr cls_ClassInfo Class{"sample_Request", "a request"};
    cls_Record* NewState(unsigned procedureType) const override;
};

/// Steps named "S0", "S1", ... by one letter each: I initial, G static, P frequency, B buckling.
kprC_StepContainer StepsOf(const char* kinds);
cow_String StepName(int index);

/// The steps of most examples: Initial, Load and Unload (general), Freq and Buckle (perturbation).
kprC_StepContainer LoadFreqUnloadBuckle();

template <class T>
std::vector<int> Statuses(const T& object, const kprC_StepContainer& steps) {
    std::vector<int> numbers;
    for (int i = 0; i < steps.Size(); ++i) {
        numbers.push_back(static_cast<int>(object.Status(steps.NameAt(i))));
    }
    return numbers;
}

/// The state of an object in a step as the sample's own class.
template <class S, class T>
const S& StateIn(const T& object, const cow_String& step) {
    return static_cast<const S&>(object.ConstGetStateQuad(step).state.ConstGet());
}

template <class S>
mdl_StateEdit<S> Give(kprC_PropagatingObject& object, const cow_String& step) {
    return mdl_StateEdit<S>(object.Give(step));
}

/// A field given with a mark of its own, such as a value together with a state.
template <class S, class T>
void GiveMarked(kprC_PropagatingObject& object, const cow_String& step, mdl_PropAttr<T> S::*member,
                const char* field, const mdl_PropAttr<T>& value, Given mark) {
    mdl_GivenState& given = object.Give(step);
    static_cast<S&>(given.record.Get()).*member = value;
    const auto& fields = given.record.ConstGet().DynFields().All();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (std::string_view(field) == fields[i].name) given.marks[i] = mark;
    }
}

} // namespace sample

#endif
