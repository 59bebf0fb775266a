#include "store_interface/records/output/korC_OdbRequestTable.h"

#include "store_interface/records/output/korC_OutputCatalogue.h"

#include <string>
#include <unordered_map>
#include <vector>

using Print = korC_OdbRequestSpec::PrintEnm;

const omu_EnumTable& omu_EnumTableOf(korC_OdbRequestSpec::PrintEnm) {
    static constexpr omu_EnumRow rows[] = {{-1, "NONE", "NONE"},
                                           {0, "NODE", "NODE"},
                                           {1, "ELEMENT", "ELEMENT"},
                                           {2, "MODAL", "MODAL"},
                                           {4, "CONTACT", "CONTACT"},
                                           {5, "RADIATION", "RADIATION"},
                                           {6, "INCREMENTATION", "INCREMENTATION"},
                                           {7, "ENERGY", "ENERGY"},
                                           {8, "ELEMENT_OR_CONTACT", "ELEMENT OR CONTACT"},
                                           {9, "INTEGRATED", "INTEGRATED"}};
    static constexpr omu_EnumTable table{"korC_OdbRequestSpec::PrintEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_OdbRequestSpec::LocationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NODE", "NODE"},
                                           {1, "INTEGRATION_POINT", "INTEGRATION POINT"},
                                           {2, "WHOLE_ELEMENT", "WHOLE ELEMENT"},
                                           {3, "ELEMENT_FACE", "ELEMENT FACE"},
                                           {4, "ELEMENT_NODE", "ELEMENT NODE"},
                                           {5, "ELEMENT_SECTION", "ELEMENT SECTION"},
                                           {6, "REBAR", "REBAR"},
                                           {7, "CONTACT_NODE", "CONTACT NODE"},
                                           {8, "WHOLE_SURFACE", "WHOLE SURFACE"},
                                           {9, "WHOLE_SET", "WHOLE SET"},
                                           {10, "MODE", "MODE"},
                                           {11, "CAVITY_FACET", "CAVITY FACET"},
                                           {12, "INTEGRATED_SECTION", "INTEGRATED SECTION"}};
    static constexpr omu_EnumTable table{"korC_OdbRequestSpec::LocationEnm", rows};
    return table;
}

cow_String korC_OdbRequestSpec::InputFileIdentifier(const cow_String& variable) const {
    if (componentDeckIds.IsMember(variable)) return componentDeckIds.ConstGet(variable);
    return variable == name && !deckId.IsEmpty() ? deckId : variable;
}

bool korC_OdbRequestSpec::IsAllowed(unsigned stepType) const {
    return (procedures & korC_OdbRequestTable::Bit(stepType)) != 0;
}

struct korC_OdbRequestTable::Content {
    Content();
    const korC_OdbRequestSpec* Variable(const cow_String& name, unsigned stepType) const;
    const korC_OdbRequestSpec* Holder(const cow_String& component, unsigned stepType) const;
    /// The variable that a name stands for: its own, or that of the component.
    const korC_OdbRequestSpec* Meant(const cow_String& name, unsigned stepType) const {
        const korC_OdbRequestSpec* variable = Variable(name, stepType);
        return variable != nullptr ? variable : Holder(name, stepType);
    }

    cow_List<korC_OdbRequestSpec> specs;
    korC_OdbRequestSpec none;

private:
    std::unordered_map<std::string_view, int> byName_;
    std::unordered_map<std::string_view, std::vector<int>> byComponent_; // in catalogue order
};

namespace {

cls_xpListString Split(std::string_view names) {
    cls_xpListString list;
    while (!names.empty()) {
        const std::size_t end = std::min(names.find(' '), names.size());
        list.Append(cow_String(names.substr(0, end)));
        names.remove_prefix(std::min(end + 1, names.size()));
    }
    return list;
}

korC_OdbRequestSpec SpecOf(const korC_CatalogueRow& row) {
    korC_OdbRequestSpec spec;
    spec.name = row.name;
    spec.print = row.print;
    spec.location = row.location;
    spec.field = (row.flags & korC_CatalogueRow::FIELD) != 0;
    spec.history = (row.flags & korC_CatalogueRow::HISTORY) != 0;
    spec.components = Split(row.components);
    if ((row.flags & korC_CatalogueRow::COMPONENTS_SHARE_NAME) != 0) {
        for (int i = 0; i < spec.components.Length(); ++i) {
            spec.componentDeckIds.Insert(spec.components[i], spec.name);
        }
    }
    spec.componentInField = (row.flags & korC_CatalogueRow::COMPONENTS_IN_FIELD) != 0;
    spec.parent = row.parent;
    spec.domains = row.domains;
    spec.procedures = row.procedures;
    spec.preselectField = row.preselectField;
    spec.preselectHistory = row.preselectHistory;
    spec.doc = row.doc;
    return spec;
}

} // namespace

korC_OdbRequestTable::Content::Content() {
    for (const korC_CatalogueRow& row : korC_OutputCatalogue()) {
        const int index = specs.Length();
        specs.Append(SpecOf(row));
        byName_.emplace(row.name, index);
    }
    for (int i = 0; i < specs.Length(); ++i) {
        const cls_xpListString& components = specs[i].components;
        for (int k = 0; k < components.Length(); ++k) byComponent_[components[k].View()].push_back(i);
    }
}

const korC_OdbRequestSpec* korC_OdbRequestTable::Content::Variable(const cow_String& name,
                                                                   unsigned stepType) const {
    const auto found = byName_.find(name.View());
    if (found == byName_.end()) return nullptr;
    const korC_OdbRequestSpec& spec = specs[found->second];
    return spec.IsAllowed(stepType) ? &spec : nullptr;
}

const korC_OdbRequestSpec* korC_OdbRequestTable::Content::Holder(const cow_String& component,
                                                                 unsigned stepType) const {
    const auto found = byComponent_.find(component.View());
    if (found == byComponent_.end()) return nullptr;
    for (const int index : found->second) {
        if (specs[index].IsAllowed(stepType)) return &specs[index];
    }
    return nullptr;
}

korC_OdbRequestTable::korC_OdbRequestTable() {
    // All threads read one content.
    static const auto content = std::make_shared<const Content>();
    content_ = content;
}

const cow_List<korC_OdbRequestSpec>& korC_OdbRequestTable::Specs() const {
    return content_->specs;
}

bool korC_OdbRequestTable::IsParentRequest(const cow_String& name, unsigned stepType) const {
    return content_->Variable(name, stepType) != nullptr;
}

bool korC_OdbRequestTable::IsComponentRequest(const cow_String& name, unsigned stepType) const {
    return content_->Holder(name, stepType) != nullptr;
}

cow_String korC_OdbRequestTable::RequestFromComponent(const cow_String& name, unsigned stepType) const {
    const korC_OdbRequestSpec* holder = content_->Holder(name, stepType);
    return holder == nullptr ? cow_String() : holder->name;
}

const korC_OdbRequestSpec& korC_OdbRequestTable::Request(const cow_String& name, unsigned stepType) const {
    const korC_OdbRequestSpec* variable = content_->Variable(name, stepType);
    return variable == nullptr ? content_->none : *variable;
}

bool korC_OdbRequestTable::Available(const korC_OdbRequestSpec& spec, Channel channel, unsigned stepType,
                                     korC_DomainTypeEnm domain) const {
    if (!(channel == Channel::FIELD ? spec.field : spec.history) || !spec.IsAllowed(stepType)) return false;
    switch (domain) {
    case korC_DomainTypeEnm::ALL_DOMAINS: return true;
    // Layups, springs and fasteners are sets.
    case korC_DomainTypeEnm::LAYUP:
    case korC_DomainTypeEnm::SPRINGS:
    case korC_DomainTypeEnm::FASTENER: domain = korC_DomainTypeEnm::SET; break;
    default: break;
    }
    return (spec.domains >> static_cast<unsigned>(domain) & 1U) != 0;
}

cls_xpListString korC_OdbRequestTable::Defaults(Channel channel, unsigned stepType, bool hasSimBasedStep,
                                                korC_DomainTypeEnm domain, int) const {
    const bool onlyNodes = hasSimBasedStep && channel == Channel::FIELD && korC_IsModeBased(stepType);
    cls_xpListString names;
    for (int i = 0; i < content_->specs.Length(); ++i) {
        const korC_OdbRequestSpec& spec = content_->specs[i];
        const unsigned preselected = channel == Channel::FIELD ? spec.preselectField : spec.preselectHistory;
        if ((preselected & Bit(stepType)) == 0 || !Available(spec, channel, stepType, domain)) continue;
        if (onlyNodes && (spec.print == Print::ELEMENT || spec.print == Print::CONTACT ||
                          spec.print == Print::ELEMENT_OR_CONTACT)) {
            continue;
        }
        names.Append(spec.name);
    }
    return names;
}

cls_xpListString korC_OdbRequestTable::All(Channel channel, unsigned stepType, korC_DomainTypeEnm domain,
                                           int) const {
    cls_xpListString names;
    for (int i = 0; i < content_->specs.Length(); ++i) {
        const korC_OdbRequestSpec& spec = content_->specs[i];
        if (Available(spec, channel, stepType, domain)) names.Append(spec.name);
    }
    return names;
}

cow_List<korC_OdbRequestSpec> korC_OdbRequestTable::DefaultRequests(Channel channel, unsigned stepType,
                                                                    korC_DomainTypeEnm domain) const {
    cow_List<korC_OdbRequestSpec> specs;
    const cls_xpListString names = Defaults(channel, stepType, false, domain, 0);
    for (int i = 0; i < names.Length(); ++i) specs.Append(Request(names[i], stepType));
    return specs;
}

cls_xpListString korC_OdbRequestTable::GetInvalidPrintIdentifiers(const cls_xpListString& variables,
                                                                  unsigned stepType, PrintEnm print,
                                                                  Channel channel,
                                                                  korC_DomainTypeEnm domain) const {
    return GetInvalidPrintIdentifiers(variables, stepType, print, print, channel, domain);
}

cls_xpListString korC_OdbRequestTable::GetInvalidPrintIdentifiers(const cls_xpListString& variables,
                                                                  unsigned stepType, PrintEnm print,
                                                                  PrintEnm otherPrint, Channel,
                                                                  korC_DomainTypeEnm) const {
    cls_xpListString invalid;
    for (int i = 0; i < variables.Length(); ++i) {
        const korC_OdbRequestSpec* spec = content_->Meant(variables[i], stepType);
        if (spec == nullptr || (spec->print != print && spec->print != otherPrint)) {
            invalid.Append(variables[i]);
        }
    }
    return invalid;
}
