#ifndef QRX_MODEL_FILE_MDF_PARAMETERS_H
#define QRX_MODEL_FILE_MDF_PARAMETERS_H

#include "model_file/mdf_Value.h"
#include "store_interface/findings/fnd_Finding.h"

#include <optional>
#include <string>
#include <vector>

class mdf_Diagnostics;
class mdf_Writer;

/// The range that a text of limits stands for: comparisons with commas between, "> 0, <= 20", or a span with
/// its ends, "0.5 .. 20", one of which may be left out.
struct mdf_Limits {
    struct Bound {
        double value = 0.0;
        bool inclusive = true;
    };
    std::optional<Bound> low;
    std::optional<Bound> high;

    /// Nothing for a text that says no limits.
    static std::optional<mdf_Limits> Of(std::string_view text);
    bool Allow(double value) const;
};

/// A short name for places of a model file that are varied together.
struct mdf_Parameter {
    std::string name;
    /// JSON pointers.
    std::vector<std::string> pointers;
    std::string unit;
    /// As given; empty for none.
    std::string limits;
    std::string description;
    mdf_Limits range;
};

/// Reads the member "parameters" of a model file's root, whose models have not been read yet.
std::vector<mdf_Parameter> mdf_ReadParameters(const mdf_Value& root, mdf_Diagnostics& diagnostics);
/// Writes them as that member; nothing where there are none.
void mdf_WriteParameters(mdf_Writer& out, const std::vector<mdf_Parameter>& parameters);

#endif
