#include "conditions/oif_Submodel.h"

#include "keyword_layer/qkw_QuorixName.h"

oif_Submodel::oif_Submodel(bool shellToSolid, const kbcC_SubmodelBC& bc, const cow_String& setName)
    : shellToSolid_(shellToSolid), globalElset_(bc.globalElset), shellThickness_(bc.shellThickness),
      absoluteExteriorTolerance_(bc.absoluteExteriorTolerance), exteriorTolerance_(bc.exteriorTolerance),
      regions_(setName) {}

bool oif_Submodel::IsEqual(const kbcC_SubmodelBC& bc) const {
    return shellThickness_ == bc.shellThickness &&
           absoluteExteriorTolerance_ == bc.absoluteExteriorTolerance &&
           exteriorTolerance_ == bc.exteriorTolerance && globalElset_ == bc.globalElset;
}

void oif_Submodel::Write(utl_Stream& stream) const {
    stream << "*Submodel";
    if (shellToSolid_) stream << ", shell to solid";
    if (shellThickness_ != 0.0) stream << ", shell thickness=" << shellThickness_;
    if (absoluteExteriorTolerance_ != 0.0)
        stream << ", absolute exterior tolerance=" << absoluteExteriorTolerance_;
    // One word with a capital in it, unlike the parameter before.
    if (exteriorTolerance_ != 0.0) stream << ", exteriorTolerance=" << exteriorTolerance_;
    if (!globalElset_.IsEmpty()) stream << ", global elset=" << qkw_QuorixName(globalElset_, false);
    stream.LineBreak();
    for (int i = 0; i < regions_.Length(); ++i) {
        stream << regions_[i] << ", ";
        stream.LineBreak();
    }
}

void oif_BoundarySubmodelList::Append(const cow_String& stepName, const cow_String& name,
                                      const oif_Boundary& boundary) {
    qkw_KeywordList& keywords = keywords_.GetOrInsert(stepName);
    // All boundaries of a step share the first one's line, whatever theirs would be.
    if (keywords.IsEmpty()) keywords.Append(oif_RawKeyword(boundary.BCSubmodelKwd()));
    keywords.Append(boundary);
    names_.GetOrInsert(stepName).Append(name);
}

qkw_KeywordList oif_BoundarySubmodelList::Keywords(const cow_String& stepName) const {
    const qkw_KeywordList* kept = keywords_.Find(stepName);
    if (kept == nullptr) return {};
    qkw_KeywordList keywords;
    keywords.Append(
        oif_Comment(cow_String("Name: ") + Joined(names_.ConstGet(stepName)) + " Type: Submodel"));
    keywords.Concatenate(*kept);
    return keywords;
}

cow_String oif_BoundarySubmodelList::Joined(const cow_List<cow_String>& names) {
    cow_String joined;
    for (int i = 0; i < names.Length(); ++i) {
        if (i > 0) joined += ", ";
        joined += names[i];
    }
    return joined;
}
