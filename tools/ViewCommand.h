#ifndef QRX_TOOLS_VIEWCOMMAND_H
#define QRX_TOOLS_VIEWCOMMAND_H

#include "tools/RunReport.h"

#include <string>

/// What the user asked `qrxdeck view` for.
struct ViewRequest {
    std::string model;
    /// The one to show of a file with several models; may be empty.
    std::string modelName;
    /// Empty: the model file's name with ".html" for its extension, in the current folder.
    std::string output;
    /// Empty: no mesh file.
    std::string vtu;
    /// Shows the page when it stands.
    bool open = false;
};

/// Writes the page that shows a model.
ExitCode RunView(const ViewRequest& request, RunReport& report);

#endif
