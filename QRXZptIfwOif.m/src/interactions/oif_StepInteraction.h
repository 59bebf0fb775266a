#ifndef QRX_OIF_STEPINTERACTION_H
#define QRX_OIF_STEPINTERACTION_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Interaction.h"

/// An interaction that is said anew in each step that begins, changes or ends it:
///     *Keyword, PARAMETERS, op=NEW
///     SET, DATA
/// In the step that ends it the keyword has neither parameters nor data; ", op=NEW" alone clears what was.
class oif_StepInteraction : public qkw_Keyword {
public:
    oif_StepInteraction(const mdl_ObjCow<kinC_Interaction>& interaction, const cow_String& step, oif_Op op,
                        const cow_String& setName)
        : interaction_(interaction), step_(step), setName_(setName), op_(op) {}
    void Write(utl_Stream& stream) const override;

protected:
    /// The interaction as a T; raises if it is of another class.
    template <class T>
    const T& Record() const {
        return nex_canDynamicCastRef<T>(interaction_.ConstGet(), NEX_HERE);
    }
    const cow_String& Step() const { return step_; }
    const cow_String& SetName() const { return setName_; }
    /// The parameter, which has a comma of its own, if the name isn't empty; the line may break ahead of it.
    static void AddNamed(oif_KeywordLine& line, const char* parameter, const cow_String& name);
    /// The region type, in an explicit procedure.
    void AddRegionType(oif_KeywordLine& line, int regionType) const;

private:
    virtual const char* Keyword() const = 0;
    virtual void AddParameters(oif_KeywordLine& line) const = 0;
    /// Without the line's end.
    virtual void WriteData(utl_Stream& stream) const = 0;

    mdl_ObjCow<kinC_Interaction> interaction_;
    cow_String step_;
    cow_String setName_;
    oif_Op op_;
};

#endif
