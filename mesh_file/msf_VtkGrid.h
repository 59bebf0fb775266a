#ifndef QRX_MESH_FILE_MSF_VTKGRID_H
#define QRX_MESH_FILE_MSF_VTKGRID_H

#include "mesh_file/msf_Builder.h"

#include <bit>
#include <cstdint>

/// Numbers of one type, as they stand in the file or, decoded, in a buffer of its own.
struct msf_NumberArray {
    enum class Type { NONE, INT8, UINT8, INT16, UINT16, INT32, UINT32, INT64, UINT64, FLOAT32, FLOAT64 };

    std::string name;
    Type type = Type::NONE;
    int components = 1;
    std::size_t count = 0;
    const char* data = nullptr;
    bool bigEndian = false;
    std::vector<char> own;

    bool IsReal() const { return type == Type::FLOAT32 || type == Type::FLOAT64; }
    long long Int(std::size_t i) const {
        long long number = 0;
        Ints(i, 1, &number);
        return number;
    }
    /// `many` numbers from place `begin`; reals as zero.
    void Ints(std::size_t begin, std::size_t many, long long* numbers) const;
    void Reals(std::size_t begin, std::size_t many, double* numbers) const;
    static std::size_t SizeOf(Type type);
    /// Takes the numbers over.
    template <class T>
    void Own(const std::vector<T>& numbers, Type ofType) {
        own.resize(numbers.size() * sizeof(T));
        if (!own.empty()) std::memcpy(own.data(), numbers.data(), own.size());
        data = own.data();
        count = numbers.size();
        type = ofType;
        bigEndian = false;
    }

private:
    template <class T, class U>
    void Take(std::size_t begin, std::size_t many, U* numbers) const;
};

/// An unstructured grid as both formats of VTK have it.
struct msf_VtkGrid {
    msf_NumberArray points;
    msf_NumberArray types;
    /// Where the nodes of each cell end; with a zero ahead of them in newer legacy files.
    msf_NumberArray offsets;
    bool offsetsBeginWithZero = false;
    /// Each cell's nodes stand behind their number; there are no offsets.
    bool countsAhead = false;
    msf_NumberArray connectivity;
    std::vector<msf_NumberArray> cellArrays;
};

/// Fills the mesh: labels are the places in the file, from 1; values of the arrays that the options name
/// become groups; wedges that some writers turn inside out are put right.
void msf_FillFromVtk(const msf_VtkGrid& grid, const msf_Options& options, msf_Builder& builder);

#endif
