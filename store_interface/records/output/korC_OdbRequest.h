#ifndef QRX_STORE_KORC_ODBREQUEST_H
#define QRX_STORE_KORC_ODBREQUEST_H

#include "store_interface/records/cls_Lists.h"
#include "store_interface/records/output/korC_OutputEnums.h"
#include "store_interface/regions/rgnC_Region.h"

/// What one step asks of one place of the model, merged from the requests that ask for the same. Made while a
/// deck is built; a store never holds it.
class korC_OdbRequest : public mem_AllocationOperators {
public:
    /// Time points have another number here than in korC_TypeEnm.
    enum class TypeEnm : int {
        FREQUENCY = 0,
        NUMBER_INTERVAL = 1,
        TIME_INTERVAL = 2,
        MODE_LIST = 3,
        TIME_POINTS = 4
    };

    rgnC_Region region; ///< without a value: the whole model
    cow_String boltLoad;
    cow_List<cow_String> interactions; ///< the first is the one used
    cow_String section;
    cow_List<cow_String> springs;
    korC_RebarEnm rebar = korC_RebarEnm::EXCLUDE;
    korC_VariablesTypeEnm variablesType = korC_VariablesTypeEnm::LISTED;
    cls_xpListString variables;
    cls_xpListInt sectionPoints;
    TypeEnm frequencyType = TypeEnm::FREQUENCY;
    // A request of zeros is what says that there is no output.
    int frequency = 0;
    int numberInterval = 0;
    double timeInterval = 0.0;
    cls_xpListInt modeList;
    bool timeMarks = false;
    bool directions = true;
    cow_String filter;
    cow_String timePoints;
    cow_String name; ///< of the requests that it was merged from

    korC_DomainTypeEnm DomainType() const;
    /// All but the name, values that its frequencyType doesn't use included.
    bool operator==(const korC_OdbRequest& other) const;
    /// Whether both are written equally often: only what their frequencyType uses counts.
    bool EqualFrequency(const korC_OdbRequest& other) const;
    /// The order of the deck: preselected and all variables of the whole model, those of other places,
    /// listed ones; in each by frequency, filter and name.
    bool operator<(const korC_OdbRequest& other) const;
};
const omu_EnumTable& omu_EnumTableOf(korC_OdbRequest::TypeEnm);

/// The requests of one step for one channel of the results, in the order in which they arose.
class korC_OdbChannel : public mem_AllocationOperators {
public:
    enum class TypeEnm : int { FIELD = 1, HISTORY = 2 };

    explicit korC_OdbChannel(bool isField) : type(isField ? TypeEnm::FIELD : TypeEnm::HISTORY) {}

    TypeEnm type;
    cow_List<korC_OdbRequest> requests;

    TypeEnm Type() const { return type; }
    bool IsField() const { return type == TypeEnm::FIELD; }
};
const omu_EnumTable& omu_EnumTableOf(korC_OdbChannel::TypeEnm);

#endif
