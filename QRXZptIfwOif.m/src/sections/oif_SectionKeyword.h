#ifndef QRX_OIF_SECTIONKEYWORD_H
#define QRX_OIF_SECTIONKEYWORD_H

#include "base/oif_ClassRows.h"
#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/sections/kseC_Section.h"

/// How the keyword class K writes sections of one record class.
template <class K>
struct oif_SectionForm {
    unsigned typeId;
    void (*write)(const K& keyword, utl_Stream& stream, const kseC_Section& section);

    template <class R, void (K::*Write)(utl_Stream&, const R&) const>
    static constexpr oif_SectionForm Of() {
        return {R::Class.Id(), [](const K& keyword, utl_Stream& stream, const kseC_Section& section) {
                    (keyword.*Write)(stream, static_cast<const R&>(section));
                }};
    }
};

/// The section of one element set; the record is shared. Names of sets, orientations and controls are given
/// in the form that the deck has them in; an orientation or controls of empty name are left out.
template <class T>
class oif_SectionKeywordOf : public qkw_KeywordOf<T> {
public:
    oif_SectionKeywordOf(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section,
                         const cow_String& orientationName, const cow_String& controlsName)
        : setName_(setName), section_(section), orientationName_(orientationName),
          controlsName_(controlsName) {}

protected:
    const cow_String& SetName() const { return setName_; }
    const kseC_Section& Section() const { return section_.ConstGet(); }
    const cow_String& OrientationName() const { return orientationName_; }
    void WriteControls(oif_KeywordLine& line) const {
        line.BreakingIf(!controlsName_.IsEmpty(), "controls=", controlsName_);
    }
    /// Of the orientation and the controls.
    void WriteNames(oif_KeywordLine& line) const {
        line.BreakingIf(!orientationName_.IsEmpty(), "orientation=", orientationName_);
        WriteControls(line);
    }

private:
    cow_String setName_;
    mdl_ObjCow<kseC_Section> section_;
    cow_String orientationName_;
    cow_String controlsName_;
};

#endif
