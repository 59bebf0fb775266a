#include "store_interface/records/output/korC_OdbRequest.h"

#include "store_interface/records/steps/kprC_Predicates.h"

#include <algorithm>
#include <tuple>

const omu_EnumTable& omu_EnumTableOf(korC_TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FREQUENCY", "FREQUENCY"},
                                           {1, "NUMBER_INTERVAL", "NUMBER INTERVAL"},
                                           {2, "TIME_INTERVAL", "TIME INTERVAL"},
                                           {3, "MODE_LIST", "MODE LIST"},
                                           {5, "TIME_POINTS", "TIME POINTS"}};
    static constexpr omu_EnumTable table{"korC_TypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_OdbRequest::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FREQUENCY", "FREQUENCY"},
                                           {1, "NUMBER_INTERVAL", "NUMBER INTERVAL"},
                                           {2, "TIME_INTERVAL", "TIME INTERVAL"},
                                           {3, "MODE_LIST", "MODE LIST"},
                                           {4, "TIME_POINTS", "TIME POINTS"}};
    static constexpr omu_EnumTable table{"korC_OdbRequest::TypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_VariablesTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "LISTED", "LISTED"}, {1, "PRESELECT", "PRESELECT"}, {2, "ALL", "ALL"}};
    static constexpr omu_EnumTable table{"korC_VariablesTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_DomainTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "WHOLE_MODEL", "WHOLE MODEL"},
                                           {1, "SET", "SET"},
                                           {2, "BOLT_LOAD", "BOLT LOAD"},
                                           {3, "LAYUP", "LAYUP"},
                                           {4, "SPRINGS", "SPRINGS"},
                                           {5, "FASTENER", "FASTENER"},
                                           {6, "CONTACT_SURFACE", "CONTACT SURFACE"},
                                           {7, "INTEGRATED_SECTION", "INTEGRATED SECTION"},
                                           {8, "INTERACTION", "INTERACTION"},
                                           {14, "ALL_DOMAINS", "ALL DOMAINS"}};
    static constexpr omu_EnumTable table{"korC_DomainTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_RebarEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "EXCLUDE", "EXCLUDE"}, {1, "INCLUDE", "INCLUDE"}, {2, "ONLY", "ONLY"}};
    static constexpr omu_EnumTable table{"korC_RebarEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(korC_OdbChannel::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{1, "FIELD", "FIELD"}, {2, "HISTORY", "HISTORY"}};
    static constexpr omu_EnumTable table{"korC_OdbChannel::TypeEnm", rows};
    return table;
}

korC_TypeEnm korC_DefaultOutputType(unsigned stepType, bool) {
    if (kprC_IsExplicit(stepType)) return korC_TypeEnm::NUMBER_INTERVAL;
    return kprC_ModesIsAllowed(stepType) ? korC_TypeEnm::MODE_LIST : korC_TypeEnm::FREQUENCY;
}

namespace {

/// Below, equal or above: -1, 0, 1.
template <class T>
int Compared(const T& a, const T& b) {
    return a < b ? -1 : b < a ? 1 : 0;
}

int Compared(const cls_xpListInt& a, const cls_xpListInt& b) {
    for (int i = 0; i < std::min(a.Length(), b.Length()); ++i) {
        if (a[i] != b[i]) return a[i] < b[i] ? -1 : 1;
    }
    return Compared(a.Length(), b.Length());
}

/// Lists stand behind preselected and all variables, those of the whole model first.
int Rank(const korC_OdbRequest& request) {
    if (request.variablesType == korC_VariablesTypeEnm::LISTED) return 2;
    return request.DomainType() == korC_DomainTypeEnm::WHOLE_MODEL ? 0 : 1;
}

/// By kind, then by the values that the kind uses.
int ComparedFrequency(const korC_OdbRequest& a, const korC_OdbRequest& b) {
    using Type = korC_OdbRequest::TypeEnm;
    if (a.frequencyType != b.frequencyType) return a.frequencyType < b.frequencyType ? -1 : 1;
    int compared = 0;
    switch (a.frequencyType) {
    case Type::FREQUENCY: return Compared(a.frequency, b.frequency);
    case Type::MODE_LIST: return Compared(a.modeList, b.modeList);
    case Type::NUMBER_INTERVAL: compared = Compared(a.numberInterval, b.numberInterval); break;
    case Type::TIME_INTERVAL: compared = Compared(a.timeInterval, b.timeInterval); break;
    case Type::TIME_POINTS: compared = Compared(a.timePoints.View(), b.timePoints.View()); break;
    }
    return compared != 0 ? compared : Compared(a.timeMarks, b.timeMarks);
}

} // namespace

korC_DomainTypeEnm korC_OdbRequest::DomainType() const {
    constexpr int surface = 8;
    if (!section.IsEmpty()) return korC_DomainTypeEnm::INTEGRATED_SECTION;
    if (!springs.IsEmpty()) return korC_DomainTypeEnm::SPRINGS;
    if (!interactions.IsEmpty()) return korC_DomainTypeEnm::INTERACTION;
    if (!boltLoad.IsEmpty()) return korC_DomainTypeEnm::BOLT_LOAD;
    if (!region.HasValue()) return korC_DomainTypeEnm::WHOLE_MODEL;
    return (region.FlagWord() & surface) != 0 ? korC_DomainTypeEnm::CONTACT_SURFACE : korC_DomainTypeEnm::SET;
}

bool korC_OdbRequest::operator==(const korC_OdbRequest& other) const {
    return region == other.region && boltLoad == other.boltLoad && interactions == other.interactions &&
           section == other.section && springs == other.springs && rebar == other.rebar &&
           variablesType == other.variablesType && variables == other.variables &&
           sectionPoints == other.sectionPoints && frequencyType == other.frequencyType &&
           frequency == other.frequency && numberInterval == other.numberInterval &&
           timeInterval == other.timeInterval && modeList == other.modeList && timeMarks == other.timeMarks &&
           directions == other.directions && filter == other.filter && timePoints == other.timePoints;
}

bool korC_OdbRequest::EqualFrequency(const korC_OdbRequest& other) const {
    return ComparedFrequency(*this, other) == 0;
}

bool korC_OdbRequest::operator<(const korC_OdbRequest& other) const {
    if (Rank(*this) != Rank(other)) return Rank(*this) < Rank(other);
    const int frequencies = ComparedFrequency(*this, other);
    if (frequencies != 0) return frequencies < 0;
    return std::tuple(filter.View(), name.View()) < std::tuple(other.filter.View(), other.name.View());
}
