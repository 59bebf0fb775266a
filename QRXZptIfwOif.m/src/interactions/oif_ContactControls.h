#ifndef QRX_OIF_CONTACTCONTROLS_H
#define QRX_OIF_CONTACTCONTROLS_H

#include "base/oif_Comment.h"
#include "store_interface/records/interactions/kinC_ContactControls.h"

/// The comment ahead of the controls of a contact.
inline oif_Comment oif_ContactControlsComment(const cow_String& name) {
    return oif_Comment(cow_String("Contact Controls for Interaction: ") + name);
}

/// Controls of one contact, of the implicit solver by its surfaces, of the explicit solver by its set of
/// contact pairs:
///     *Contact Controls, master=Inst.MASTER, slave=Inst.SLAVE, reset
///     *Contact Controls, master=Inst.MASTER, slave=Inst.SLAVE, stabilize=0.1
///     *Contact Controls, cpset=Int-1, fastlocaltrk=NO, reset
/// A contact that is new has nothing to reset.
class oif_ContactControls final : public qkw_KeywordOf<oif_ContactControls> {
public:
    oif_ContactControls(const kinC_ExpContactControls& controls, const cow_String& name, bool isNew,
                        bool reset)
        : controls_(controls.DeepCopy()), name_(name), isNew_(isNew), reset_(reset) {}
    oif_ContactControls(const kinC_StdContactControls& controls, const cow_String& master,
                        const cow_String& slave, bool isNew, bool reset)
        : controls_(controls.DeepCopy()), master_(master), slave_(slave), isNew_(isNew), reset_(reset) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteExplicit(utl_Stream& stream, const kinC_ExpContactControls& controls) const;
    void WriteStandard(utl_Stream& stream, const kinC_StdContactControls& controls) const;

    mdl_ObjCow<kinC_ContactControls> controls_;
    cow_String name_;
    cow_String master_;
    cow_String slave_;
    bool isNew_;
    bool reset_;
};

#endif
