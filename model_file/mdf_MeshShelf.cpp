#include "model_file/mdf_MeshShelf.h"

#include "model_file/mdf_Pointer.h"
#include "platform/plt_Files.h"

#include <algorithm>

namespace {

// Of large meshes the last two are kept whatever they take.
constexpr std::size_t kMostFiles = 16;
constexpr std::size_t kFewFiles = 2;
constexpr std::size_t kMostBytes = std::size_t{512} << 20;

/// About what a mesh takes.
std::size_t BytesOf(const odiK_Mesh& mesh) {
    constexpr std::size_t ofNode = 20;
    std::size_t bytes = ofNode * static_cast<std::size_t>(mesh.Nodes().NumNodes());
    for (const odiK_ElementClass& elements : mesh.Classes())
        bytes += sizeof(int) * (elements.connectivity.size() + elements.labels.size());
    return bytes;
}

} // namespace

std::string mdf_MeshShelf::StateOf(const std::filesystem::path& file) {
    std::error_code error;
    const auto bytes = std::filesystem::file_size(file, error);
    if (error) return {};
    const auto time = std::filesystem::last_write_time(file, error);
    if (error) return {};
    return std::to_string(bytes) + "\n" +
           std::to_string(static_cast<long long>(time.time_since_epoch().count()));
}

mdf_MeshShelf::Key mdf_MeshShelf::KeyOf(const mdf_Value& json, const fnd_Path& path,
                                        const std::string& modelFile) const {
    std::string place = path.Text();
    const bool changed =
        std::ranges::any_of(changes_, [&](const std::string& change) { return fnd_IsBelow(change, place); });
    if (!changed) return place;
    const mdf_Value* file = json.IsObject() ? json.Find("file") : nullptr;
    if (file == nullptr || !file->IsString()) return {};
    const std::string state = StateOf(plt_Path(modelFile).parent_path() / plt_Path(file->String()));
    return state.empty() ? Key() : place + "\n" + state + "\n" + mdf_JsonText(json);
}

std::shared_ptr<const mdf_MeshShelf::Entry> mdf_MeshShelf::Find(const Key& key) {
    if (key.empty()) return nullptr;
    const std::lock_guard<std::mutex> lock(kept_->mutex);
    const auto place = kept_->places.find(key);
    if (place == kept_->places.end()) return nullptr;
    if (IsOfFile(key)) kept_->files.splice(kept_->files.begin(), kept_->files, place->second.use);
    return place->second.entry;
}

cow_CountedHld<odiK_Mesh> mdf_MeshShelf::Keep(const Key& key, Entry entry) {
    if (key.empty()) return entry.mesh;
    const std::lock_guard<std::mutex> lock(kept_->mutex);
    const auto [place, isNew] = kept_->places.try_emplace(key);
    if (!isNew) return place->second.entry->mesh;
    place->second.entry = std::make_shared<const Entry>(std::move(entry));
    if (IsOfFile(key)) {
        kept_->files.push_front(key);
        place->second.use = kept_->files.begin();
        const auto bytes = [this] {
            std::size_t all = 0;
            for (const Key& each : kept_->files) all += BytesOf(*kept_->places[each].entry->mesh);
            return all;
        };
        while (kept_->files.size() > kMostFiles ||
               (kept_->files.size() > kFewFiles && bytes() > kMostBytes)) {
            kept_->places.erase(kept_->files.back());
            kept_->files.pop_back();
        }
    }
    return place->second.entry->mesh;
}
