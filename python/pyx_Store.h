#ifndef QRX_PYTHON_PYX_STORE_H
#define QRX_PYTHON_PYX_STORE_H

#include "model_file/mdf_ModelFile.h"
#include "python/pyx_Errors.h"

#include <map>
#include <memory>

/// A store made of Python's models, or read from a model file, for as long as a call of Python's needs it.
class pyx_Store {
public:
    /// `document` is what a model file would hold. Raises when it is wrong.
    static std::unique_ptr<pyx_Store> Of(py::handle document);
    static std::unique_ptr<pyx_Store> Load(const std::string& path);
    /// All that there is to say of a document, errors too.
    static py::list Check(py::handle document);

    /// {model: its tree} as Python's models take it.
    py::dict Trees() const;
    /// Replaces the file as a whole; gives its bytes. `threads` is oif_Writer's.
    long long WriteDeck(const std::string& path, int threads) const;
    /// Hands the deck to a function, block by block.
    void WriteDeckTo(const py::object& write, int threads) const;
    py::bytes Deck(int threads) const;
    /// The text of the model file; the folder is where paths of mesh files begin.
    py::bytes ModelFile(const std::string& folder) const;
    /// [(name, pointers, unit, limits, description)].
    py::list Parameters() const;
    void SetParameters(const py::list& parameters);
    /// The history as JSON, and its table by kind.
    std::pair<std::string, std::map<std::string, std::string>> History() const;
    std::string Description() const;
    /// [(load case, text)].
    py::list DeckLines(const std::string& repository, const std::string& name, const std::string& step) const;
    std::string Page(const std::string& title) const;

    static void Add(py::module_& module);

private:
    const odiK_Model& Model() const;

    std::unique_ptr<odb_Odb> odb_;
    mdf_Report report_;
};

#endif
