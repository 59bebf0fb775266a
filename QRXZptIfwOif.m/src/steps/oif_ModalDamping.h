#ifndef QRX_OIF_MODALDAMPING_H
#define QRX_OIF_MODALDAMPING_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_ModalDamping.h"

#include <variant>

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

#endif
