#pragma once
/// The class factory of the framework: one creator function behind ITOVClassFactory.
#include "tov/ITOVClassFactory.h"
#include "tov/sdk/CTOVUnknown.h"

class CTOVClassFactory : public ITOVClassFactory, public CTOVUnknown {
public:
    /// The static creator of a component class (`TOVCreate`).
    typedef int (*Creator)(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);

    /// Makes a self-controlling factory for `creator` and queries it for `iid`.
    /// On success `*out` holds the only reference; a wrong iid leaves nothing behind.
    static TOVRESULT Create(Creator creator, const _tovUID& iid, void** out);

    CTOVClassFactory(Creator creator, ITOVUnknown* outer);
    ~CTOVClassFactory() override;

    TOV_FORWARD_UNKNOWN
    /// An aggregated instance may be asked for ITOVUnknown only.
    TOVRESULT CreateInstance(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    Creator m_Creator;
};
