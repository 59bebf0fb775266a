#ifndef QRX_OIF_INSTANCEBUILDER_H
#define QRX_OIF_INSTANCEBUILDER_H

#include "base/oif_Component.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"

/// The opening of an instance, with its placement:
///     *Instance, name=NAME, part=PART
///     translation x, y, z
///     point x, y, z of the axis, a second point of it, angle in degrees
/// The first data line stands when the instance is moved or turned, the second when it is turned.
class oif_Instance final : public qkw_KeywordOf<oif_Instance> {
public:
    explicit oif_Instance(const ddb_PartInstance& instance);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    cow_String partName_;
    gsl_Matrix placement_;
};

/// Opens the instances' blocks and puts their meshes in them; writes for each connector section assignment of
/// the assembly its connector elements and their section, and once for each such section its behaviour.
class oif_InstanceBuilder final : public oif_ComponentOf<oif_InstanceBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    void CreateInstances();
    void CreateMesh();
    void CreateConnectors();
};

#endif
