#ifndef QRX_TESTS_FAULTS_STORE_H
#define QRX_TESTS_FAULTS_STORE_H

#include "store_interface/model/odb_Odb.h"

#include <filesystem>
#include <string>
#include <vector>

/// Fills a store with two instances of a part of `nodes` nodes and as many trusses less one, with sets, a
/// surface and solver input.
void FillStore(odb_Odb& odb, int nodes);

/// A fresh folder, removed with all that is in it.
class TestFolder {
public:
    TestFolder();
    TestFolder(const TestFolder&) = delete;
    TestFolder& operator=(const TestFolder&) = delete;
    ~TestFolder();

    std::string Path(const std::string& name) const { return (path_ / name).string(); }
    /// The names of what is in it, hidden ones included, in order.
    std::vector<std::string> Entries() const;
    void Put(const std::string& name, const std::string& text) const;
    std::string Text(const std::string& name) const;

private:
    std::filesystem::path path_;
};

#endif
