#include "mesh_file/msf_Apart.h"

#include "mesh_file/msf_Source.h"
#include "platform/plt_Files.h"
#include "platform/plt_Process.h"

#include <cerrno>
#include <cstdint>
#include <system_error>

namespace {

/// Puts a mesh, or the reason why there is none, into a pipe. Arrays go with their length ahead.
class Sender {
public:
    explicit Sender(int pipe) : pipe_(pipe) {}

    void Bytes(const void* data, std::size_t size) {
        const char* at = static_cast<const char*>(data);
        while (size > 0) {
            const ssize_t written = plt_Write(pipe_, at, size);
            if (written < 0 && errno == EINTR) continue;
            if (written <= 0) plt_EndNow(1);
            at += written;
            size -= static_cast<std::size_t>(written);
        }
    }
    void Number(std::uint64_t number) { Bytes(&number, sizeof number); }
    template <class T>
    void Array(const T& array) {
        Number(array.size());
        Bytes(array.data(), array.size() * sizeof(array[0]));
    }

    void Problem(const msf_Problem& problem) {
        Number(0);
        for (const std::string* text : {&problem.place, &problem.found, &problem.expected}) Array(*text);
    }
    void Mesh(const msf_Mesh& mesh) {
        Number(1);
        Array(mesh.format);
        Array(mesh.nodeLabels);
        Array(mesh.coordinates);
        Number(mesh.blocks.size());
        for (const msf_Block& block : mesh.blocks) {
            Number(static_cast<std::uint64_t>(block.kind));
            Array(block.labels);
            Array(block.nodes);
        }
        Number(mesh.groups.size());
        for (const msf_Group& group : mesh.groups) {
            Array(group.name);
            Number(static_cast<std::uint64_t>(group.dimension));
            Array(group.cells);
            Array(group.nodes);
        }
        Number(mesh.notes.size());
        for (const std::string& note : mesh.notes) Array(note);
    }

private:
    int pipe_;
};

/// Takes it out again; false when the sender died on the way.
class Receiver {
public:
    explicit Receiver(int pipe) : pipe_(pipe) {}

    bool Mesh(msf_Mesh& mesh, msf_Problem& problem) {
        if (Number() == 0) {
            Array(problem.place);
            Array(problem.found);
            Array(problem.expected);
            return whole_;
        }
        Array(mesh.format);
        Array(mesh.nodeLabels);
        Array(mesh.coordinates);
        for (std::uint64_t count = Number(); whole_ && count > 0; --count) {
            msf_Block& block = mesh.blocks.emplace_back();
            block.kind = static_cast<cel_KindEnm>(Number());
            Array(block.labels);
            Array(block.nodes);
        }
        for (std::uint64_t count = Number(); whole_ && count > 0; --count) {
            msf_Group& group = mesh.groups.emplace_back();
            Array(group.name);
            group.dimension = static_cast<int>(Number());
            Array(group.cells);
            Array(group.nodes);
        }
        for (std::uint64_t count = Number(); whole_ && count > 0; --count) Array(mesh.notes.emplace_back());
        return whole_;
    }

private:
    void Bytes(void* data, std::size_t size) {
        char* at = static_cast<char*>(data);
        while (whole_ && size > 0) {
            const ssize_t got = plt_Read(pipe_, at, size);
            if (got < 0 && errno == EINTR) continue;
            whole_ = got > 0;
            if (!whole_) return;
            at += got;
            size -= static_cast<std::size_t>(got);
        }
    }
    std::uint64_t Number() {
        std::uint64_t number = 0;
        Bytes(&number, sizeof number);
        return whole_ ? number : 0;
    }
    template <class T>
    void Array(T& array) {
        array.resize(static_cast<std::size_t>(Number()));
        Bytes(array.data(), array.size() * sizeof(array[0]));
    }

    int pipe_;
    bool whole_ = true;
};

[[noreturn]] void FailForTheSystem() {
    msf_Fail("", "the file can't be read: " + std::generic_category().message(errno), "");
}

} // namespace

void msf_ReadApart(void (*readHere)(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh),
                   const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    const auto work = [&](int pipe) {
        Sender sender(pipe);
        try {
            readHere(input, options, mesh);
            sender.Mesh(mesh);
        } catch (const msf_Failure& failure) {
            sender.Problem(failure.problem);
        }
        return true;
    };
    msf_Problem problem;
    bool whole = false;
    const auto take = [&](int pipe) { whole = Receiver(pipe).Mesh(mesh, problem); };
    const plt_ApartEnm ended = plt_RunApart(work, take);
    if (ended == plt_ApartEnm::NO_PROCESS) FailForTheSystem();
    if (!whole || ended == plt_ApartEnm::DIED) {
        mesh = msf_Mesh();
        msf_Fail("", "the library that reads the format failed on the file", "a whole file");
    }
    if (!problem.found.empty()) throw msf_Failure{std::move(problem)};
}
