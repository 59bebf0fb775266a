#ifndef QRX_OIF_COMPONENT_H
#define QRX_OIF_COMPONENT_H

#include "base/oif_ModelInfo.h"
#include "keyword_layer/qkw_BuilderComponent.h"

/// Base of the component class T: copying, and access to the store behind the model view.
template <class T>
class oif_ComponentOf : public qkw_BuilderComponent {
public:
    explicit oif_ComponentOf(oif_ModelInfo& modelInfo) : qkw_BuilderComponent(modelInfo) {}
    qkw_BuilderComponent* Copy() const override { return new T(static_cast<const T&>(*this)); }

protected:
    oif_ModelInfo& Info() const { return static_cast<oif_ModelInfo&>(ModelInfo()); }
    const ddb_Model& Store() const { return Info().DdbModel(); }

    /// Calls `visit(key, instance)` for each part instance of the assembly, in the order of the deck.
    template <class Visitor>
    void ForEachPartInstance(const Visitor& visit) const {
        for (ddb_InstanceContainerIT it = Store().rootAssembly().instance().createIterator(); !it.isDone();
             it.next()) {
            const ddb_BaseInstance instance = it.currentValue();
            if (instance.IsPartInstance()) visit(it.currentKey(), ddb_PartInstance(instance));
        }
    }
};

#endif
