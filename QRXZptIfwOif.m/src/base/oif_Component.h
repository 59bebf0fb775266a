#ifndef QRX_OIF_COMPONENT_H
#define QRX_OIF_COMPONENT_H

#include "base/oif_ModelInfo.h"
#include "keyword_layer/qkw_BuilderComponent.h"

/// Base of the component class T: copying, and the model and the run information in the form that they have
/// over the store.
template <class T>
class oif_ComponentOf : public qkw_BuilderComponent {
public:
    explicit oif_ComponentOf(oif_ModelInfo& modelInfo) : qkw_BuilderComponent(modelInfo) {}
    qkw_BuilderComponent* Copy() const override { return new T(static_cast<const T&>(*this)); }

protected:
    oif_ModelInfo& ModelInfo() const {
        return static_cast<oif_ModelInfo&>(qkw_BuilderComponent::ModelInfo());
    }
    const oif_Model& Model() const { return static_cast<const oif_Model&>(qkw_BuilderComponent::Model()); }

    /// Calls `visit(key, instance)` for each part instance of the assembly, in the order of the deck.
    template <class Visitor>
    void ForEachPartInstance(const Visitor& visit) const {
        for (const auto& [key, instance] : Model().Instances()) {
            if (instance.IsPartInstance()) visit(key, ddb_PartInstance(instance));
        }
    }
};

#endif
