#pragma once
/// A view is one interface face of an object (IAAFMob2 of a Mob, IAAFSequence
/// of a sequence, ...). The object makes each view at its first query and
/// keeps it until the object dies; the view counts references on the object.
#include "ModelObject.h"
#include "ViewMaker.h"
#include "aaf/AAFCOM.h"

namespace aafmodel {

class ViewBase {
public:
    virtual ~ViewBase() = default;
    /// The interface pointer for `iid`, which the view's maker said it answers.
    virtual void* As(const aafUID_t& iid) = 0;
};

/// The view of `Primary`, which also answers the interfaces `Also` that
/// `Primary` derives from (IAAFMob for IAAFMob2).
template <class Primary, class... Also>
class View : public Primary, public ViewBase {
public:
    explicit View(ModelObject& object) : m_object(object) {}

    AAFRESULT QueryInterface(REFIID riid, void** ppvObj) override { return m_object.QueryInterface(riid, ppvObj); }
    aafUInt32 AddRef() override { return m_object.AddRef(); }
    aafUInt32 Release() override { return m_object.Release(); }

    static bool Answers(const aafUID_t& iid) {
        return iid == AAFInterfaceID<Primary>::value || ((iid == AAFInterfaceID<Also>::value) || ...);
    }
    void* As(const aafUID_t& iid) override {
        void* out = static_cast<Primary*>(this);
        (void)((iid == AAFInterfaceID<Also>::value ? (out = static_cast<Also*>(this), true) : false) || ...);
        return out;
    }

protected:
    ModelObject& m_object;
};

template <class V>
ViewBase* MakeView(ModelObject& object) {
    return new V(object);
}

/// The maker of view class `V`, one per class for the program's life.
template <class V>
const ViewMaker& MakerOf() {
    static const ViewMaker maker{&V::Answers, &MakeView<V>};
    return maker;
}

}  // namespace aafmodel
