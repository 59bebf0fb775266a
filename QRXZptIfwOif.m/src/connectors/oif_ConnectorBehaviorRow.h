#ifndef QRX_OIF_CONNECTORBEHAVIORROW_H
#define QRX_OIF_CONNECTORBEHAVIORROW_H

#include "connectors/oif_ConnectorOptions.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"

#include <span>

/// What the writer knows of a class of behaviour options.
struct oif_ConnectorBehaviorRow {
    unsigned typeId;
    /// Its keyword; `index` is the option's place in the behaviour. Derived components that it refers to are
    /// added to `derived`.
    qkw_KeywordHandle (*make)(const kbeC_ConnectorBehaviorOption& option, const qkw_ModelInfo& modelInfo,
                              int index, oif_DerivedComponents& derived);
};

/// A row for each class of options.
std::span<const oif_ConnectorBehaviorRow> oif_ConnectorBehaviorRows();

/// The behaviour of a section: its head, its options in order, and behind them all derived components that
/// they refer to. Empty for a section without any behaviour.
qkw_KeywordList oif_ConnectorBehaviorKeywords(const cow_String& name, const kseC_ConnectorSection& section,
                                              const qkw_ModelInfo& modelInfo);

#endif
