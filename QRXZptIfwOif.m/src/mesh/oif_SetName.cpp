#include "mesh/oif_SetName.h"

#include "base/oif_Model.h"
#include "foundation/omu_QuorixName.h"
#include "keyword_layer/qkw_QuorixName.h"

#include <algorithm>
#include <cstdlib>
#include <string>

namespace {

constexpr char kMeshOfPath[] = ".mesh[";

} // namespace

oif_SetName::oif_SetName(const cow_String& name, bool) {
    const cow_List<cow_String> tokens = SplitScopedSet(name);
    const int count = tokens.Length();
    if (count > 3) return;
    setName_ = tokens[count - 1];
    if (count >= 2) instanceName_ = tokens[count - 2];
}

oif_SetName::oif_SetName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo) {
    if (!region.Shortcut().HasValue()) return;
    const cow_String& path = region.Shortcut().Path();
    const int id = region.ConstSet().Id();
    const ddb_Model& model = static_cast<const oif_Model&>(modelInfo.Model()).Model();
    const int mesh = path.Find(kMeshOfPath);
    if (mesh < 0) {
        const ddb_Set set = model.rootAssembly().set(id);
        setName_ = set.setLabel();
        isNodeSet_ = set.setType() == res_SetTypeEnm::NODES;
        return;
    }
    const int begin = mesh + static_cast<int>(sizeof kMeshOfPath) - 1;
    const int end = path.Find("].setData", begin);
    const cow_String number = cow_String().Append(path, begin, (end < 0 ? path.Length() : end) - begin);
    const auto instance = model.rootAssembly().instance().FindByMeshIndex(std::atoi(number.CStr()));
    if (!instance) return;
    const ddb_Set set = instance->set(id);
    setName_ = set.setLabel();
    instanceName_ = instance->name();
    isNodeSet_ = set.setType() == res_SetTypeEnm::NODES;
}

cow_List<cow_String> oif_SetName::SplitScopedSet(const cow_String& name) {
    cow_List<cow_String> tokens;
    const std::string_view text = name.View();
    bool inQuotes = false;
    std::size_t begin = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (inQuotes) {
            inQuotes = text[i] != '"';
        } else if (text[i] == '.') {
            tokens.Append(cow_String(text.substr(begin, i - begin)));
            begin = i + 1;
        } else {
            inQuotes = text[i] == '"';
        }
    }
    tokens.Append(cow_String(text.substr(begin)));
    return tokens;
}

cow_String oif_SetName::ScopedText(regionContext context) const {
    if (context != regionContext::ASSEMBLY || instanceName_.IsEmpty()) return setName_;
    return instanceName_ + "." + setName_;
}

cow_String oif_SetName::UniqueSetName(regionContext context) const {
    return QuoteIfNeeded(ScopedText(context));
}

cow_String oif_SetName::UniqueSetName(cow_String name, regionContext context) {
    setName_ = name;
    return UniqueSetName(context);
}

cow_String oif_SetName::UniqueSurfaceName(regionContext context) const {
    cow_String text = ScopedText(context);
    if (isNodeSet_) {
        std::string surface(text.View());
        for (char& c : surface) {
            if (c == '.') c = '_';
        }
        text = cow_String(surface) + "_CNS_";
    }
    return QuoteIfNeeded(text);
}

cow_String oif_SetName::QuoteIfNeeded(const cow_String& name) {
    const std::string_view text = name.View();
    std::string quoted;
    for (std::size_t begin = 0; begin <= text.size();) {
        const std::size_t end = std::min(text.find('.', begin), text.size());
        const std::string_view piece = text.substr(begin, end - begin);
        const std::string_view quote = omu_QuorixName::NeedsQuotes(piece) ? "\"" : "";
        quoted.append(begin > 0 ? "." : "").append(quote).append(piece).append(quote);
        begin = end + 1;
    }
    return quoted.size() == text.size() ? name : cow_String(std::string_view(quoted));
}

bool oif_SetName::IsQuoted(cow_String text) {
    return text.Length() > 2 && text.View().front() == '"' && text.View().back() == '"';
}

cow_String oif_SetName::Unquote(cow_String text) {
    return IsQuoted(text) ? cow_String().Append(text, 1, text.Length() - 2) : text;
}

void oif_SetName::SplitName(const cow_String& name, cow_String& prefix, cow_String& last) {
    qkw_QuorixName::SplitName(name, prefix, last);
}

cow_String oif_RegionName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo) {
    return oif_SetName(region, modelInfo).UniqueSetName(oif_SetName::regionContext::ASSEMBLY);
}

cow_String oif_SurfaceName(const rgnC_Region& region, const qkw_ModelInfo& modelInfo) {
    return oif_SetName(region, modelInfo).UniqueSurfaceName(oif_SetName::regionContext::ASSEMBLY);
}
