#ifndef QRX_MODEL_FILE_MDF_SCHEMA_H
#define QRX_MODEL_FILE_MDF_SCHEMA_H

#include <nlohmann/json_fwd.hpp>

/// The JSON Schema of model files.
nlohmann::ordered_json mdf_Schema();

#endif
