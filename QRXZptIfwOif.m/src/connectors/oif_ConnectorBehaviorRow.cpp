#include "connectors/oif_ConnectorBehaviorRow.h"

#include "base/oif_ClassRows.h"
#include "connectors/oif_ConnectorSection.h"

namespace {

using BehaviorOption = kbeC_ConnectorBehaviorOption;

template <class R>
qkw_KeywordHandle Make(const BehaviorOption& option, const qkw_ModelInfo&, int, oif_DerivedComponents&) {
    return qkw_KeywordHandle(oif_ConnectorOption<R>(static_cast<const R&>(option)));
}

/// An option with potentials, whose terms may be derived components.
template <class R, class Keyword>
qkw_KeywordHandle MakeWithDerived(const BehaviorOption& option,
                                  [[maybe_unused]] const qkw_ModelInfo& modelInfo, int index,
                                  oif_DerivedComponents& derived) {
    const auto file = [&](const Keyword& keyword) {
        keyword.GetDerivedComponents(derived);
        return qkw_KeywordHandle(keyword);
    };
    const R& record = static_cast<const R&>(option);
    if constexpr (std::is_constructible_v<Keyword, const R&, const qkw_ModelInfo&, int>) {
        return file(Keyword(record, modelInfo, index));
    } else {
        return file(Keyword(record, index));
    }
}

constexpr oif_ConnectorBehaviorRow kBehaviorRows[] = {
    {kbeC_ConnectorElasticity::Class.Id(), Make<kbeC_ConnectorElasticity>},
    {kbeC_ConnectorDamping::Class.Id(), Make<kbeC_ConnectorDamping>},
    {kbeC_ConnectorStop::Class.Id(), Make<kbeC_ConnectorStop>},
    {kbeC_ConnectorLock::Class.Id(), Make<kbeC_ConnectorLock>},
    {kbeC_ConnectorFailure::Class.Id(), Make<kbeC_ConnectorFailure>},
    {kbeC_ConnectorFriction::Class.Id(), MakeWithDerived<kbeC_ConnectorFriction, oif_ConnectorFriction>},
    {kbeC_ConnectorPlasticity::Class.Id(),
     MakeWithDerived<kbeC_ConnectorPlasticity, oif_ConnectorPlasticity>},
    {kbeC_ConnectorDamage::Class.Id(), MakeWithDerived<kbeC_ConnectorDamage, oif_ConnectorDamage>},
};

} // namespace

std::span<const oif_ConnectorBehaviorRow> oif_ConnectorBehaviorRows() {
    return kBehaviorRows;
}

qkw_KeywordList oif_ConnectorBehaviorKeywords(const cow_String& name, const kseC_ConnectorSection& section,
                                              const qkw_ModelInfo& modelInfo) {
    qkw_KeywordList keywords;
    if (kseC_Utils::IsConnectorSectionEmpty(section)) return keywords;
    keywords.Append(oif_ConnectorBehavior(name, section.regularize, section.useBehaviorRegularization,
                                          section.regularization, section.extrapolationLinear,
                                          section.integrationExplicit));
    keywords.Append(oif_ConnectorConstitutiveReference(section));
    oif_DerivedComponents derived;
    int index = 0;
    for (const auto& option : section.options) {
        const oif_ConnectorBehaviorRow* row = oif_FindRow(kBehaviorRows, option.ConstGet().DynTypeId());
        if (row != nullptr) keywords.Append(row->make(option.ConstGet(), modelInfo, index, derived));
        ++index;
    }
    for (const auto& [componentName, component] : derived) {
        keywords.Append(oif_DerivedComponent(componentName, component));
    }
    return keywords;
}
