#ifndef QRX_PYTHON_PYX_STUDY_H
#define QRX_PYTHON_PYX_STUDY_H

#include "python/pyx_Errors.h"
#include "study/sty_Variants.h"

#include <memory>
#include <mutex>

/// A model of Python's as the template of a study. Several threads of Python may make decks at once.
class pyx_Study {
public:
    /// `document` is what a model file would hold. Raises when it is wrong.
    explicit pyx_Study(py::handle document);

    /// The deck of a row, whose values stand in a dict by column, or None where the row failed; and what
    /// became of it, as a line of a ledger.
    py::tuple Make(long long row, py::handle values);

    static void Add(py::module_& module);

private:
    std::unique_ptr<sty_Variants> Take();
    const sty_Columns& ColumnsOf(const std::vector<std::string>& names);

    std::mutex mutex_;
    sty_MeshTexts meshes_;
    std::unique_ptr<sty_Variants> first_; // of which the others are twins
    std::vector<fnd_Finding> baseline_;
    std::vector<std::unique_ptr<sty_Variants>> free_;
    std::map<std::vector<std::string>, std::unique_ptr<sty_Columns>> columns_;
};

#endif
