#ifndef QRX_OIF_STEPREQUESTS_H
#define QRX_OIF_STEPREQUESTS_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_StepRequests.h"

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
    void AddRead(oif_KeywordLine& line) const;

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
