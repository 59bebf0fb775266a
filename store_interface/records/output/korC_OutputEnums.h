#ifndef QRX_STORE_KORC_OUTPUTENUMS_H
#define QRX_STORE_KORC_OUTPUTENUMS_H

#include "foundation/omu_PrimEnum.h"

/// How often a request writes, as its state holds it.
enum class korC_TypeEnm : int {
    FREQUENCY = 0,
    NUMBER_INTERVAL = 1,
    TIME_INTERVAL = 2,
    MODE_LIST = 3,
    TIME_POINTS = 5,
};
const omu_EnumTable& omu_EnumTableOf(korC_TypeEnm);

/// Which variables a request wants.
enum class korC_VariablesTypeEnm : int { LISTED = 0, PRESELECT = 1, ALL = 2 };
const omu_EnumTable& omu_EnumTableOf(korC_VariablesTypeEnm);

/// What a request is about. ALL_DOMAINS only goes into questions to the catalogue.
enum class korC_DomainTypeEnm : int {
    WHOLE_MODEL = 0,
    SET = 1,
    BOLT_LOAD = 2,
    LAYUP = 3,
    SPRINGS = 4,
    FASTENER = 5,
    CONTACT_SURFACE = 6,
    INTEGRATED_SECTION = 7,
    INTERACTION = 8,
    ALL_DOMAINS = 14,
};
const omu_EnumTable& omu_EnumTableOf(korC_DomainTypeEnm);

/// Whether element results of rebar are wanted.
enum class korC_RebarEnm : int { EXCLUDE = 0, INCLUDE = 1, ONLY = 2 };
const omu_EnumTable& omu_EnumTableOf(korC_RebarEnm);

/// How often a request comes when it doesn't say, by the number of the procedure; the same for field and
/// history output. FREQUENCY for a number that is no procedure's.
korC_TypeEnm korC_DefaultOutputType(unsigned stepType, bool isField);

#endif
