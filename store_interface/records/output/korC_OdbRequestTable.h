#ifndef QRX_STORE_KORC_ODBREQUESTTABLE_H
#define QRX_STORE_KORC_ODBREQUESTTABLE_H

#include "foundation/cow_Map.h"
#include "foundation/thr_ThreadSingleton.h"
#include "store_interface/records/output/korC_OdbRequest.h"

#include <memory>

/// One output variable.
class korC_OdbRequestSpec : public mem_AllocationOperators {
public:
    /// The sub-keyword that lists the variable; ELEMENT_OR_CONTACT goes to both.
    enum class PrintEnm : int {
        NONE = -1,
        NODE = 0,
        ELEMENT = 1,
        MODAL = 2,
        CONTACT = 4,
        RADIATION = 5,
        INCREMENTATION = 6,
        ENERGY = 7,
        ELEMENT_OR_CONTACT = 8,
        INTEGRATED = 9,
    };
    /// Where its values stand.
    enum class LocationEnm : int {
        NODE = 0,
        INTEGRATION_POINT = 1,
        WHOLE_ELEMENT = 2,
        ELEMENT_FACE = 3,
        ELEMENT_NODE = 4,
        ELEMENT_SECTION = 5,
        REBAR = 6,
        CONTACT_NODE = 7,
        WHOLE_SURFACE = 8,
        WHOLE_SET = 9,
        MODE = 10,
        CAVITY_FACET = 11,
        INTEGRATED_SECTION = 12,
    };

    cow_String name;
    PrintEnm print = PrintEnm::NONE;
    LocationEnm location = LocationEnm::NODE;
    bool field = false;   ///< allowed in field requests
    bool history = false; ///< allowed in history requests
    cls_xpListString components;
    cow_Map<cow_String, cow_String> componentDeckIds; ///< what decks call some of the components
    bool componentInField = false;                    ///< a field request may ask for a single component
    cow_String parent;                                ///< a wider variable that contains this one
    cow_String deckId;                                ///< what decks call it; empty: its name
    unsigned domains = 0; ///< a bit for each korC_DomainTypeEnm in which it may be asked for
    // A bit for each procedure, see korC_OdbRequestTable::Bit.
    unsigned procedures = 0;
    unsigned preselectField = 0;
    unsigned preselectHistory = 0;
    cow_String doc;

    const cow_String& Name() const { return name; }
    PrintEnm Print() const { return print; }
    LocationEnm Location() const { return location; }
    bool HasIdentifiers() const { return componentDeckIds.Count() > 0 || !deckId.IsEmpty(); }
    /// What decks call the variable or its component.
    cow_String InputFileIdentifier(const cow_String& variable) const;
    bool IsAllowed(unsigned stepType) const;
};
const omu_EnumTable& omu_EnumTableOf(korC_OdbRequestSpec::PrintEnm);
const omu_EnumTable& omu_EnumTableOf(korC_OdbRequestSpec::LocationEnm);

/// The catalogue of output variables: which there are, who may ask for them, what they are called. Its order
/// is that of every list that it gives. A name is a variable's ("parent request") or that of a single
/// component.
class korC_OdbRequestTable {
public:
    using Channel = korC_OdbChannel::TypeEnm;
    using PrintEnm = korC_OdbRequestSpec::PrintEnm;

    static const korC_OdbRequestTable& Instance() {
        return thr_ThreadSingleton<korC_OdbRequestTable>::Instance();
    }

    static constexpr int fieldFrequencyDef() { return 1; }
    static constexpr int historyFrequencyDef() { return 1; }
    static constexpr int fieldNumberIntervalDef() { return 20; }
    static constexpr int historyNumberIntervalDef() { return 200; }
    static constexpr int implicitFrequencyDef() { return 10; }
    static constexpr int lastIncrementDef() { return 99999; }

    /// A procedure's bit; 0 for a number that is none's.
    static constexpr unsigned Bit(unsigned stepType) {
        constexpr unsigned first = 0x23C0065;
        constexpr unsigned last = 0x23C007E;
        return stepType < first || stepType > last ? 0 : 1U << (stepType - first);
    }

    const cow_List<korC_OdbRequestSpec>& Specs() const;
    bool IsParentRequest(const cow_String& name, unsigned stepType) const;
    bool IsComponentRequest(const cow_String& name, unsigned stepType) const;
    /// The first variable that has the component; empty if there is none.
    cow_String RequestFromComponent(const cow_String& name, unsigned stepType) const;
    /// The variable, or an empty one that no keyword lists.
    const korC_OdbRequestSpec& Request(const cow_String& name, unsigned stepType) const;
    bool Available(const korC_OdbRequestSpec& spec, Channel channel, unsigned stepType,
                   korC_DomainTypeEnm domain) const;
    /// The preselected variables. Mode-based steps behind one that keeps its modes in reduced form preselect
    /// neither element nor contact variables for fields.
    cls_xpListString Defaults(Channel channel, unsigned stepType, bool hasSimBasedStep,
                              korC_DomainTypeEnm domain, int reserved) const;
    cls_xpListString All(Channel channel, unsigned stepType, korC_DomainTypeEnm domain, int reserved) const;
    cow_List<korC_OdbRequestSpec> DefaultRequests(Channel channel, unsigned stepType,
                                                  korC_DomainTypeEnm domain) const;
    /// Those of the variables that none of the prints lists.
    cls_xpListString GetInvalidPrintIdentifiers(const cls_xpListString& variables, unsigned stepType,
                                                PrintEnm print, Channel channel,
                                                korC_DomainTypeEnm domain) const;
    cls_xpListString GetInvalidPrintIdentifiers(const cls_xpListString& variables, unsigned stepType,
                                                PrintEnm print, PrintEnm otherPrint, Channel channel,
                                                korC_DomainTypeEnm domain) const;

private:
    friend class thr_ThreadSingleton<korC_OdbRequestTable>;
    korC_OdbRequestTable();

    struct Content;
    std::shared_ptr<const Content> content_;
};

#endif
