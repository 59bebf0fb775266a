#ifndef QRX_MODEL_FILE_MDF_MESHSHELF_H
#define QRX_MODEL_FILE_MDF_MESHSHELF_H

#include "model_file/mdf_Value.h"
#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/odiK_Mesh.h"

#include <filesystem>
#include <list>
#include <map>
#include <memory>
#include <mutex>
#include <span>
#include <string>

/// Meshes that were read for one variant of a model file and serve the others: those that no variant changes,
/// and the last ones that came from mesher's files. Several threads may read variants at once, each with a
/// shelf of its own on the same meshes.
class mdf_MeshShelf {
public:
    /// A mesh, and what reading it had to say.
    struct Entry {
        cow_CountedHld<odiK_Mesh> mesh;
        std::vector<fnd_Finding> findings;
    };
    /// Empty for a mesh that is read anew each time.
    using Key = std::string;
    static bool IsOfFile(const Key& key) { return key.find('\n') != std::string::npos; }
    /// Size and time of change of a file, empty where there is none: one that was written anew is another
    /// one.
    static std::string StateOf(const std::filesystem::path& file);

    /// With nothing on it.
    mdf_MeshShelf() : kept_(std::make_shared<Kept>()) {}
    /// The same meshes for a variant in which values at these JSON pointers differ from the first one's.
    mdf_MeshShelf(const mdf_MeshShelf& other, std::span<const std::string> changes)
        : kept_(other.kept_), changes_(changes) {}

    Key KeyOf(const mdf_Value& json, const fnd_Path& path, const std::string& modelFile) const;
    std::shared_ptr<const Entry> Find(const Key& key);
    /// Puts an entry on the shelf; gives its mesh, or that of the entry that is there by now.
    cow_CountedHld<odiK_Mesh> Keep(const Key& key, Entry entry);

private:
    struct Place {
        std::shared_ptr<const Entry> entry;
        /// Of a mesh from a file: among the keys of these.
        std::list<Key>::iterator use;
    };
    struct Kept {
        std::mutex mutex;
        std::map<Key, Place> places;
        std::list<Key> files; // the last one used is the first
    };

    std::shared_ptr<Kept> kept_;
    std::span<const std::string> changes_;
};

#endif
