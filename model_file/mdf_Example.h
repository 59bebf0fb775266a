#ifndef QRX_MODEL_FILE_MDF_EXAMPLE_H
#define QRX_MODEL_FILE_MDF_EXAMPLE_H

#include "store_interface/records/cls_ClassRegistrar.h"

#include <nlohmann/json.hpp>

/// A record of the class as a model file may have it: what its fields' table gives for an example, with its
/// class, and with a state of an object that lives across steps.
nlohmann::ordered_json mdf_ExampleOf(const cls_ClassEntry& entry);

#endif
