#ifndef QRX_STORE_MDL_PROPATTR_H
#define QRX_STORE_MDL_PROPATTR_H

#include "store_interface/records/cls_FieldTable.h"

/// How a step came to hold the value of an attribute.
enum class mdl_PropAttributeStateEnm : int { NEVER_SET = 0, SET = 1, CARRIED = 2, CLEARED = 3 };
const omu_EnumTable& omu_EnumTableOf(mdl_PropAttributeStateEnm);

/// The status of an object in a step. The numbers are fixed; the words never reach a deck.
enum class mdl_PropagationStatusEnm : int {
    NOT_YET_ACTIVE = 0,
    CREATED = 1,
    PROPAGATED = 2,
    MODIFIED = 3,
    DEACTIVATED = 4,
    NO_LONGER_ACTIVE = 5,
    TYPE_NOT_APPLICABLE = 6,
    INSTANCE_NOT_APPLICABLE = 7,
    BUILT_INTO_BASE_STATE = 8,
    PROPAGATED_FROM_BASE_STATE = 9,
    MODIFIED_FROM_BASE_STATE = 10,
    DEACTIVATED_FROM_BASE_STATE = 11,
    BUILT_INTO_MODES = 12,
    NOT_APPLICABLE = 13,
    FIELD_PROPAGATED = 14,
    FIELD_RESET = 15,
};
const omu_EnumTable& omu_EnumTableOf(mdl_PropagationStatusEnm);

/// One value of a per-step state, together with the way in which the step came to hold it.
template <class T>
class mdl_PropAttr {
public:
    using Value = T;
    mdl_PropAttr() = default;
    explicit mdl_PropAttr(const T& value, mdl_PropAttributeStateEnm state = mdl_PropAttributeStateEnm::SET)
        : value_(value), state_(state) {}

    /// The value whatever the state; the default of T while there is none.
    const T& ConstGet() const { return value_; }
    mdl_PropAttributeStateEnm State() const { return state_; }
    /// It has a value in the step: set there or carried over.
    bool IsActive() const {
        return state_ == mdl_PropAttributeStateEnm::SET || state_ == mdl_PropAttributeStateEnm::CARRIED;
    }
    /// It was set or cleared in this step.
    bool IsModified() const {
        return state_ == mdl_PropAttributeStateEnm::SET || state_ == mdl_PropAttributeStateEnm::CLEARED;
    }
    void Set(const T& value) {
        value_ = value;
        state_ = mdl_PropAttributeStateEnm::SET;
    }
    void SetState(mdl_PropAttributeStateEnm state) { state_ = state; }
    T& WritableValue() { return value_; }

    friend bool operator==(const mdl_PropAttr& a, mdl_PropAttributeStateEnm state) {
        return a.state_ == state;
    }
    friend bool operator==(const mdl_PropAttr& a, const T& value) { return a.value_ == value; }

private:
    T value_ = T();
    mdl_PropAttributeStateEnm state_ = mdl_PropAttributeStateEnm::NEVER_SET;
};

template <class T>
struct cls_TypeOf<mdl_PropAttr<T>> {
    class Type : public cls_AttributeType {
    public:
        Type() : cls_AttributeType(cls_TypeOf<T>::Instance()) {}
        bool Equal(const void* a, const void* b) const override {
            return State(a) == State(b) && ValueType().Equal(Value(a), Value(b));
        }
        void Assign(void* to, const void* from) const override { At(to) = At(from); }
        int State(const void* attribute) const override { return static_cast<int>(At(attribute).State()); }
        void SetState(void* attribute, int state) const override {
            At(attribute).SetState(static_cast<mdl_PropAttributeStateEnm>(state));
        }
        const void* Value(const void* attribute) const override { return &At(attribute).ConstGet(); }
        void* WritableValue(void* attribute) const override { return &At(attribute).WritableValue(); }
        void Reset(void* attribute) const override { At(attribute) = mdl_PropAttr<T>(); }

    private:
        static mdl_PropAttr<T>& At(void* value) { return *static_cast<mdl_PropAttr<T>*>(value); }
        static const mdl_PropAttr<T>& At(const void* value) {
            return *static_cast<const mdl_PropAttr<T>*>(value);
        }
    };
    static const cls_FieldType& Instance() {
        static const Type type;
        return type;
    }
};

#endif
