#ifndef QRX_PYTHON_PYX_TREE_H
#define QRX_PYTHON_PYX_TREE_H

#include "model_file/mdf_ModelFile.h"
#include "python/pyx_Errors.h"

/// All that stands in a model as values, records and meshes of Python, named as in model files.
py::dict pyx_TreeOf(const odiK_Model& model, const std::list<mdf_MeshOrigin>& origins);

#endif
