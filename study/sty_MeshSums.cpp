#include "study/sty_MeshSums.h"

#include "model_file/mdf_MeshShelf.h"
#include "model_file/mdf_Parser.h"
#include "platform/plt_Files.h"
#include "store_interface/findings/fnd_Text.h"
#include "study/sty_Sha256.h"

sty_MeshSums::sty_MeshSums(const std::string& model) : folder_(plt_Path(model).parent_path()) {}

sty_MeshSums::Known& sty_MeshSums::KnownOf(const std::string& file) {
    const std::lock_guard<std::mutex> lock(mutex_);
    std::unique_ptr<Known>& known = known_[file];
    if (known == nullptr) known = std::make_unique<Known>();
    return *known;
}

std::filesystem::path sty_MeshSums::PathOf(const std::string& file) const {
    return folder_ / plt_Path(file);
}

std::string sty_MeshSums::ProblemOf(const std::string& file, Known& known, long long row,
                                    const std::string& sum) const {
    if (known.wanted.empty()) {
        known.wanted = sum;
        known.row = row;
    }
    if (known.wanted == sum) return {};
    return "the mesh file " + fnd_Quoted(PathOf(file).string()) + " has changed since row " +
           std::to_string(known.row) + " was written";
}

std::string sty_MeshSums::Use(const std::string& file, long long row, std::string& problem) {
    Known& known = KnownOf(file);
    const std::lock_guard<std::mutex> lock(known.mutex);
    const std::string state = mdf_MeshShelf::StateOf(PathOf(file));
    if (known.sum.empty() || known.state != state) {
        known.sum = sty_Sha256OfFile(PathOf(file).string());
        known.state = state;
    }
    problem = ProblemOf(file, known, row, known.sum);
    return known.sum;
}

/// The first that `problemOf` finds of the files in a line and their sums.
template <class Visitor>
std::string sty_MeshSums::FirstProblem(const sty_Entry& entry, const Visitor& problemOf) {
    // Most lines name what others name too.
    if (entry.meshes.empty() || looked_.contains(entry.meshes)) return {};
    looked_.emplace(entry.meshes);
    mdf_Value meshes;
    std::vector<fnd_Finding> errors;
    if (!mdf_Parse(entry.meshes, meshes, errors) || !meshes.IsArray()) return {};
    for (std::size_t i = 0; i < meshes.Size(); ++i) {
        const mdf_Value mesh = meshes.Item(i);
        const mdf_Value* file = mesh.IsObject() ? mesh.Find("file") : nullptr;
        const mdf_Value* sum = mesh.IsObject() ? mesh.Find("sha256") : nullptr;
        if (file == nullptr || sum == nullptr || !file->IsString() || !sum->IsString()) continue;
        std::string problem = problemOf(file->String(), sum->String());
        if (!problem.empty()) return problem;
    }
    return {};
}

std::string sty_MeshSums::ContradictionOf(const sty_Entry& entry) {
    return FirstProblem(entry, [&](const std::string& file, const std::string& sum) {
        return ProblemOf(file, KnownOf(file), entry.row, sum);
    });
}

std::string sty_MeshSums::ProblemOf(const sty_Entry& entry) {
    return FirstProblem(entry, [&](const std::string& file, const std::string& sum) {
        std::string problem = ProblemOf(file, KnownOf(file), entry.row, sum);
        if (problem.empty()) Use(file, entry.row, problem);
        return problem;
    });
}
