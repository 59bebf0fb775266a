// Any text as a model file: it is read or refused with a reason; what was read is written as a deck, and as a
// model file that reads back the same.

#include "deck/oif_Writer.h"
#include "foundation/nex_Exception.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"

#include <cstdint>
#include <cstdlib>
#include <sstream>

namespace {

void Require(bool truth) {
    if (!truth) std::abort();
}

std::FILE* OpenNowhere(const char*, const char* mode) {
    return std::fopen("/dev/null", mode);
}

int RemoveNothing(const char*) {
    return 0;
}

std::string Written(const odb_Odb& odb) {
    std::ostringstream out;
    Require(mdf_WriteModelFile(odb, out));
    return out.str();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const bool nowhere = [] {
        qio_CurrentSystem().open = OpenNowhere;
        qio_CurrentSystem().remove = RemoveNothing;
        return true;
    }();
    Require(nowhere);
    mdf_Report report;
    const auto odb =
        mdf_ReadModelText(std::string_view(reinterpret_cast<const char*>(data), size), "m.json", report);
    Require((odb == nullptr) == report.HasErrors());
    for (const fnd_Finding& finding : report.findings) Require(!finding.Text().empty());
    if (odb == nullptr) return 0;

    const std::string first = Written(*odb);
    mdf_Report again;
    const auto copy = mdf_ReadModelText(first, "copy.json", again);
    Require(copy != nullptr);
    Require(Written(*copy) == first);
    try {
        oif_Writer(*odb).WriteInputFile("deck");
    } catch (const QRXBasException&) {
        // A model can be right in itself and still have no deck.
    }
    return 0;
}
