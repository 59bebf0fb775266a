#ifndef QRX_OIF_SETNAME_H
#define QRX_OIF_SETNAME_H

#include "foundation/cow_List.h"
#include "keyword_layer/qkw_ModelInfo.h"

/// The name of a set or surface as keywords refer to it.
class oif_SetName {
public:
    /// From where a name is used. In the assembly, a set of an instance has the instance's name before it.
    enum class regionContext : int { INSTANCE = 1, ASSEMBLY = 2 };

    /// From a dotted name, whose parts may be quoted: the last part is the set, the one before it the
    /// instance. A name of more than three parts gives neither.
    oif_SetName(const cow_String& name, bool);
    /// From a region. A region without a value, or of an entry that is no part instance, gives empty names.
    oif_SetName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo);

    const cow_String& InstanceName() const { return instanceName_; }
    cow_String UniqueSetName(regionContext context) const;
    /// The same for another name of the set, which is kept from then on.
    cow_String UniqueSetName(cow_String name, regionContext context);
    /// As UniqueSetName; a node set that has to serve as a surface gets "_" for every dot and "_CNS_" behind.
    cow_String UniqueSurfaceName(regionContext context) const;

    /// Quotes each dotted part by itself where it needs it. The split does not know of quotes.
    static cow_String QuoteIfNeeded(const cow_String& name);
    /// More than two characters, in double quotes.
    static bool IsQuoted(cow_String text);
    static cow_String Unquote(cow_String text);
    /// As qkw_QuorixName::SplitName.
    static void SplitName(const cow_String& name, cow_String& prefix, cow_String& last);

private:
    static cow_List<cow_String> SplitScopedSet(const cow_String& name);
    cow_String ScopedText(regionContext context) const;

    cow_String setName_;
    cow_String instanceName_;
    bool isNodeSet_ = false;
};

/// What the assembly calls a set, and a surface or a node set that serves as one; empty without a value.
cow_String oif_RegionName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo);
cow_String oif_SurfaceName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo);

#endif
