#ifndef QRX_OIF_BLOCKHEADER_H
#define QRX_OIF_BLOCKHEADER_H

#include "base/oif_Comment.h"
#include "keyword_layer/qkw_ByName.h"

/// A banner of three comment lines that stands once in the model section, once in the assembly and once in
/// each step. A component adds what these operations give before each keyword of the group: the banner the
/// first time, later a keyword that writes nothing.
class oif_BlockHeader {
public:
    explicit oif_BlockHeader(const cow_String& text)
        : banner_(oif_Comment(cow_String("\n") + text + "\n")), empty_(oif_RawKeyword("")) {}

    const qkw_KeywordHandle& ModelHeader() { return Once(modelHeaderGiven_); }
    const qkw_KeywordHandle& AssyHeader() { return Once(assyHeaderGiven_); }
    const qkw_KeywordHandle& StepHeader(const cow_String& stepName);

private:
    const qkw_KeywordHandle& Once(bool& given);

    qkw_KeywordHandle banner_;
    qkw_KeywordHandle empty_;
    bool assyHeaderGiven_ = false;
    bool modelHeaderGiven_ = false;
    qkw_ByName<bool> stepHeadersGiven_;
};

#endif
