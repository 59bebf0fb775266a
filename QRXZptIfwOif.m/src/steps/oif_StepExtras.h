#ifndef QRX_OIF_STEPEXTRAS_H
#define QRX_OIF_STEPEXTRAS_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalDamping.h"
#include "store_interface/records/steps/kprC_StepRequests.h"

#include <variant>

/// What the two mass scaling keywords share: the record and the set's name, in the form that decks refer to
/// it by.
class oif_MassScaling {
protected:
    oif_MassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : scaling_(scaling), setName_(setName) {}

    void WriteKind(utl_Stream& stream, const char* kind) const;
    void WriteRegion(utl_Stream& stream) const;
    void WriteKeyword(utl_Stream& stream, const char* keyword) const;
    void WriteDt(utl_Stream& stream) const;
    void WriteRecurrence(utl_Stream& stream) const;

    kprC_MassScaling scaling_;
    cow_String setName_;
};

/// Mass scaling once, at the beginning of a step:
///     ** Mass Scaling: Semi-Automatic
///     **               SET
///     *Fixed Mass Scaling, elset=SET, dt=1e-05, type=below min, factor=2.
/// or the reinitialisation of the mass. Another kind writes an empty line.
class oif_FixedMassScaling final : public qkw_KeywordOf<oif_FixedMassScaling>, private oif_MassScaling {
public:
    oif_FixedMassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : oif_MassScaling(scaling, setName) {}
    void Write(utl_Stream& stream) const override;
};

/// Mass scaling throughout a step: semi-automatic as above, its end, or that of a rolled piece:
///     ** Mass Scaling: Automatic
///     **               SET
///     *Variable Mass Scaling, elset=SET, type=rolling, feed rate=10.,
///     extruded length=0.1, cross section=12, direction=1, number interval=5
/// Another kind writes an empty line. A rolling direction that is none raises.
class oif_VariableMassScaling final : public qkw_KeywordOf<oif_VariableMassScaling>, private oif_MassScaling {
public:
    oif_VariableMassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : oif_MassScaling(scaling, setName) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteRolling(utl_Stream& stream) const;
};

/// Damping of modes, one row a line:
///     *Modal Damping, rayleigh, definition=FREQUENCY RANGE
///     10., 0.1, 0.002
/// Made from an absent record, it writes the bare keyword and leaves its line open.
class oif_ModalDamping final : public qkw_KeywordOf<oif_ModalDamping> {
public:
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_DirectDamping>& damping) : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_CompositeDamping>& damping) : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_RayleighDamping>& damping) : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_StructuralDamping>& damping) : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_DirectDampingByFrequency>& damping) : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_RayleighDampingByFrequency>& damping)
        : damping_(damping) {}
    explicit oif_ModalDamping(const mdl_ObjCow<kprC_StructuralDampingByFrequency>& damping)
        : damping_(damping) {}
    void Write(utl_Stream& stream) const override;

private:
    std::variant<mdl_ObjCow<kprC_DirectDamping>, mdl_ObjCow<kprC_CompositeDamping>,
                 mdl_ObjCow<kprC_RayleighDamping>, mdl_ObjCow<kprC_StructuralDamping>,
                 mdl_ObjCow<kprC_DirectDampingByFrequency>, mdl_ObjCow<kprC_RayleighDampingByFrequency>,
                 mdl_ObjCow<kprC_StructuralDampingByFrequency>>
        damping_;
};

/// The modes 1 to `count`:
///     *Select Eigenmodes, generate
///     1, 10, 1
class oif_SelectEigenmodes final : public qkw_KeywordOf<oif_SelectEigenmodes> {
public:
    explicit oif_SelectEigenmodes(int count) : count_(count) {}
    void Write(utl_Stream& stream) const override;

private:
    int count_;
};

/// The head of a load case, `*Load Case, name=NAME`.
class oif_LoadCase final : public qkw_KeywordOf<oif_LoadCase> {
public:
    explicit oif_LoadCase(const cow_String& name) : name_(name) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
};

/// What is kept for a restart, or, made from numbers, where a restart begins:
///     *Restart, write, overlay, number interval=4, time marks=YES
///     *Restart, write, frequency=10
///     *Restart, read, step=2, inc=7, end step
class oif_Restart final : public qkw_KeywordOf<oif_Restart> {
public:
    /// The `increment` that stands for none.
    static constexpr int kNoIncrement = -2;

    explicit oif_Restart(const mdl_ObjCow<kprC_Restart>& restart) : restart_(restart) {}
    /// `useInc` tells whether `increment` is one, or else an interval.
    oif_Restart(int step, int increment, bool endStep, bool useInc)
        : step_(step), increment_(increment), endStep_(endStep), useInc_(useInc) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteRead(utl_Stream& stream) const;

    mdl_ObjCow<kprC_Restart> restart_;
    int step_ = 0;
    int increment_ = kNoIncrement;
    bool endStep_ = false;
    bool useInc_ = false;
};

/// A degree of freedom to watch, `*Monitor, dof=1, node=SET, frequency=1`; the frequency in implicit steps.
/// Empty without a set.
class oif_Monitor final : public qkw_KeywordOf<oif_Monitor> {
public:
    oif_Monitor(const mdl_ObjCow<kprC_Monitor>& monitor, const cow_String& setName)
        : monitor_(monitor), setName_(setName) {}
    bool IsEmpty() const override { return setName_.IsEmpty(); }
    void Write(utl_Stream& stream) const override;

private:
    mdl_ObjCow<kprC_Monitor> monitor_;
    cow_String setName_;
};

/// `*Print` with what differs from the print in force before; nothing when nothing does. A print of another
/// kind than the former one is compared with the solver's defaults of its kind; a perturbation print goes
/// with the standard ones.
class oif_DiagnosticPrint final : public qkw_KeywordOf<oif_DiagnosticPrint> {
public:
    oif_DiagnosticPrint(const mdl_ObjCow<kprC_DiagnosticPrint>& print,
                        const mdl_ObjCow<kprC_DiagnosticPrint>& previous)
        : print_(print), previous_(previous) {}
    void Write(utl_Stream& stream) const override;

private:
    mdl_ObjCow<kprC_DiagnosticPrint> print_;
    mdl_ObjCow<kprC_DiagnosticPrint> previous_;
};

#endif
