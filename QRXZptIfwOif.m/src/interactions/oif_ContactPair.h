#ifndef QRX_OIF_CONTACTPAIR_H
#define QRX_OIF_CONTACTPAIR_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/interactions/kinC_Contact.h"

#include <optional>

class kcoC_Tie;
class oif_KeywordLine;

/// What the keywords about one contact hold: its record, the step that they look at, and the names of its
/// surfaces; a contact of a surface with itself has the one name twice.
class oif_ContactKeyword : public qkw_Keyword {
protected:
    oif_ContactKeyword() = default;
    oif_ContactKeyword(const mdl_ObjCow<kinC_Interaction>& interaction, const cow_String& step,
                       const qkw_ModelInfo& modelInfo);

    mdl_ObjCow<kinC_Interaction> interaction_;
    cow_String step_;
    cow_String master_;
    cow_String slave_;
};

/// A pair of surfaces in contact, in the form of its class:
///     *Contact Pair, interaction=Prop-1, small sliding, type=SURFACE TO SURFACE, adjust=0.0
///     Inst.SLAVE, Inst.MASTER
///     *Contact Pair, interaction=Prop-1, mechanical constraint=KINEMATIC, cpset=Int-1
///     Inst.SLAVE, Inst.MASTER
///     *Contact Pair, op=DELETE, cpset=Int-1
///     Inst.SLAVE, Inst.MASTER
///     *Contact Pair, interaction=Prop-1
///     Inst.SURFACE,
/// or, made from surfaces alone, tied. An elastic foundation writes nothing; another class raises
/// "Unimplemented interaction print".
class oif_ContactPair final : public qkw_KeywordOf<oif_ContactPair, oif_ContactKeyword> {
public:
    oif_ContactPair(const cow_String& name, const mdl_ObjCow<kinC_Interaction>& interaction,
                    const cow_String& step, const qkw_ModelInfo& modelInfo, bool cpset);
    /// Of a tie, with ", adjust=" if its position tolerance is a distance; `step` makes no difference.
    oif_ContactPair(const cow_String& name, const kcoC_Tie& tie, const cow_String& step,
                    const qkw_ModelInfo& modelInfo, bool cpset);
    /// Of a mesh-independent tie:
    ///     *Contact Pair, tied, adjust=0.1, interaction=_Tie-1
    ///     Inst.FIRST, Inst.SECOND
    oif_ContactPair(const cow_String& name, const rgnC_Region& second, const rgnC_Region& first,
                    double adjust, const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;
    /// Writes `keyword` in the form of contacts of class R; for the rows of the classes.
    template <class R>
    static void WriteAs(utl_Stream& stream, const oif_ContactPair& keyword,
                        const kinC_Interaction& interaction) {
        keyword.WritePair(stream, static_cast<const R&>(interaction));
    }

private:
    void WriteTied(utl_Stream& stream) const;
    void WritePair(utl_Stream& stream, const kinC_SurfaceToSurfaceContactStd& contact) const;
    void WritePair(utl_Stream& stream, const kinC_SurfaceToSurfaceContactXpl& contact) const;
    void WritePair(utl_Stream& stream, const kinC_SelfContactStd& contact) const;
    void WritePair(utl_Stream& stream, const kinC_SelfContactXpl& contact) const;
    oif_KeywordLine& AddCpset(oif_KeywordLine& line) const;

    cow_String name_;
    bool cpset_ = false;
    std::optional<double> adjust_; // of a tied pair
    cow_String adjustSetName_;     // of a standard pair
};

/// A pair that enters or leaves the analysis:
///     *Model Change, type=CONTACT PAIR, remove
///     Inst.SLAVE, Inst.MASTER
/// It leaves if `remove` says so or its status in the step is 4. Only pairs of the implicit solver; another
/// class raises "No *Model Change for this interaction."
class oif_ModelChange final : public qkw_KeywordOf<oif_ModelChange, oif_ContactKeyword> {
public:
    oif_ModelChange(const cow_String& name, const mdl_ObjCow<kinC_Interaction>& interaction,
                    const cow_String& step, const qkw_ModelInfo& modelInfo, bool remove);
    void Write(utl_Stream& stream) const override;

private:
    bool remove_;
};

/// The interference fit of a standard pair in a step:
///     *Contact Interference, amplitude=Amp-1
///     Inst.SLAVE, Inst.MASTER, 0.1, 0., 0., 1.
///     *Contact Interference, shrink
///     Inst.SLAVE, Inst.MASTER
class oif_ContactInterference final : public qkw_KeywordOf<oif_ContactInterference, oif_ContactKeyword> {
public:
    oif_ContactInterference(const mdl_ObjCow<kinC_Interaction>& interaction, const cow_String& step,
                            const qkw_ModelInfo& modelInfo)
        : qkw_KeywordOf(interaction, step, modelInfo) {}
    /// Whether a standard pair has no fit in the step; false for every other class.
    static bool HasNone(const mdl_ObjCow<kinC_Interaction>& interaction, const cow_String& step);
    bool IsEmpty() const override { return HasNone(interaction_, step_); }
    void Write(utl_Stream& stream) const override;

private:
    /// Null for every other class.
    static const kinC_SurfaceToSurfaceContactStdState* State(const mdl_ObjCow<kinC_Interaction>& interaction,
                                                             const cow_String& step);
};

/// The initial clearance of a pair, named by its surfaces or by the set of contact pairs:
///     *Clearance, master=Inst.MASTER, slave=Inst.SLAVE, value=0.1
///     *Clearance, cpset=Int-1, bolt, tabular
///     30., 1.25, 8., 7.2
///     Inst.NODES, 0.01
class oif_Clearance final : public qkw_KeywordOf<oif_Clearance> {
public:
    oif_Clearance(const mdl_ObjCow<kinC_SurfaceToSurfaceContact>& contact, const cow_String& setName,
                  const cow_String& master, const cow_String& slave)
        : contact_(contact), setName_(setName), master_(master), slave_(slave) {}
    oif_Clearance(const mdl_ObjCow<kinC_SurfaceToSurfaceContact>& contact, const cow_String& setName,
                  const cow_String& cpset)
        : contact_(contact), setName_(setName), cpset_(cpset) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteBolt(utl_Stream& stream, const kinC_SurfaceToSurfaceContact& contact) const;

    mdl_ObjCow<kinC_SurfaceToSurfaceContact> contact_;
    cow_String setName_;
    cow_String master_;
    cow_String slave_;
    cow_String cpset_;
};

#endif
