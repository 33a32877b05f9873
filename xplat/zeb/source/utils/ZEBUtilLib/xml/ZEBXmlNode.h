#pragma once
/// One node of the lazy XML tree: a wrapper over one node of the host's DOM,
/// or a node made in memory that the DOM never saw. A bound node fetches its
/// children on the first call that needs them, and only then.
///
/// Children are owned; attributes stand first after a load, then elements,
/// text and CDATA in document order. Comments and processing instructions
/// have no wrapper and are not in the tree.
///
/// Failures: operations that return a TOVRESULT return a thrown `int` as it
/// is and anything else as TOV_E_UNEXPECTED; those that return a string or a
/// pointer let the `int` pass. A tree belongs to one thread: even reads load.
#include <cstdint>
#include <vector>

#include "strings/ZEBString.h"
#include "tov/ITOVXmlDom.h"
#include "tov/ITOVXmlWriter.h"

namespace ZEB {
namespace XMLUtils {

class ZEBXmlElement;

class ZEBXmlNode {
public:
    /// Where a node comes from; fixed at construction, changed only by CopyTo.
    enum Origin : int32_t {
        kOriginBound = 0,
        kOriginNew = 3,
    };
    enum Status : int32_t {
        kStatusNotLoaded = 0,
        kStatusLoaded = 1,
        kStatusChanged = 2,
        kStatusNew = 3,
        kStatusDeleted = 4,
    };

    ZEBXmlNode(const ZEBXmlNode&) = delete;
    virtual ~ZEBXmlNode();

    /// Fetches the children from the DOM when the status is not loaded;
    /// otherwise does nothing. ZEB_E_NOTREADY without a DOM node.
    virtual TOVRESULT Load();
    virtual void OnChanged();
    /// Makes `target` a copy of this node and its children. Every child must
    /// be bound (ZEB_E_NOTREADY otherwise), so a node with a child made in
    /// memory cannot be copied. The copied children belong to `target`; a
    /// copy onto itself changes nothing.
    virtual TOVRESULT CopyTo(ZEBXmlNode& target) const;
    /// Releases the DOM node and deletes the children; the status becomes not loaded.
    virtual void Clear();
    /// Marks the node deleted; it stays in the tree until a Reload.
    virtual TOVRESULT Delete();
    /// The child wrapping `dom`, bound and appended first when there is none;
    /// null for a null or unknown node, on a deleted node, or when appending fails.
    virtual ZEBXmlNode* Append(UTIL::ITOVXmlDomNode* dom);
    /// Adopts `node` as the last child. A bound node must not be here already
    /// (TOV_E_UNEXPECTED). A failed append leaves the children as they were
    /// and `node` with the caller.
    virtual TOVRESULT Append(ZEBXmlNode* node);
    /// Removes and deletes the child wrapping `dom`; ZEB_E_NOTFOUND when none does.
    virtual TOVRESULT Remove(UTIL::ITOVXmlDomNode* dom);
    /// Takes `node` out of the children without deleting it: it goes back to
    /// the caller, with no owner. A node that is not a child is no failure.
    virtual TOVRESULT Remove(ZEBXmlNode* node);
    /// Rebuilds the children from the DOM unless the node is loaded and
    /// unchanged; pending changes are gone.
    virtual TOVRESULT Reload();
    /// Drops the changes of this node and, recursively, of its bound
    /// children. Children made in memory are deleted: nothing else owns them.
    virtual TOVRESULT DiscardChanges();
    virtual TOVRESULT Save(UTIL::ITOVXmlWriter* writer) = 0;
    /// The DOM's name and value; a null string from the DOM gives the empty string.
    virtual ZEBString GetName() const;
    virtual ZEBString GetValue() const;
    /// Called whenever the node is bound to another DOM node (or to none), so
    /// that a subclass can drop what it cached of the former one.
    virtual void DomChanged() {}

public:
    /// The node's type number (1 element, 2 attribute, 3 text, 4 CDATA),
    /// known without asking the DOM.
    virtual int32_t NodeKind() const = 0;

    /// A new empty wrapper made in memory, of the class for `dom`'s type, not
    /// bound to it; null for an unknown type. A null `dom` throws TOV_E_INVALIDARG.
    static ZEBXmlNode* CreateNew(UTIL::ITOVXmlDomNode* dom);
    /// A new wrapper bound to `dom` (one reference), not loaded; null and
    /// unknown types as CreateNew.
    static ZEBXmlNode* Bind(UTIL::ITOVXmlDomNode* dom);

    /// The DOM node for passing in; ZEB_E_NOTREADY when there is none.
    UTIL::ITOVXmlDomNode* InArg() const;
    /// Clears the node and hands out its DOM field for a call to fill; the
    /// node put there is owned here and not loaded yet.
    UTIL::ITOVXmlDomNode** OutArg();
    /// Binds the node anew to `dom` (unless it is bound to it already): the
    /// children go and the status becomes not loaded.
    ZEBXmlNode& operator=(UTIL::ITOVXmlDomNode* dom);
    /// CopyTo from `other`; a failure is thrown.
    ZEBXmlNode& operator=(const ZEBXmlNode& other);

    bool IsNew() const { return m_Origin == kOriginNew; }
    int32_t GetStatus() const { return m_Status; }
    /// The DOM's node type; ZEB_E_NOTREADY without a DOM node.
    int32_t GetType() const;
    /// Loads, then the child wrapping `dom`, or null. A child made in memory
    /// met before the match throws ZEB_E_NOTREADY.
    ZEBXmlNode* Lookup(UTIL::ITOVXmlDomNode* dom);
    ZEBXmlNode* Owner() const { return m_pOwner; }

protected:
    /// A node made in memory, status new.
    ZEBXmlNode();
    explicit ZEBXmlNode(ZEBXmlNode* owner);
    /// A node bound to `dom` with a reference of its own, not loaded.
    explicit ZEBXmlNode(UTIL::ITOVXmlDomNode* dom);

    /// True when the node answers from its own stored strings rather than the DOM.
    bool HoldsOwnText() const { return m_Status == kStatusChanged || m_Origin == kOriginNew; }
    /// The owner as an element; ZEB_E_NOTREADY when it is none.
    ZEBXmlElement& OwningElement() const;

    /// A string handed out by the DOM, owned from here on; null gives the empty string.
    static ZEBString Adopt(ITOVString* fetched);
    /// The empty string, in UTF-16.
    static ZEBString EmptyText();
    /// A copy of a stored string, which may never have been set.
    static ZEBString StoredText(const ZEBString& stored);
    /// Copies a stored string that may never have been set.
    static void CopyStored(ZEBString& to, const ZEBString& from);

    UTIL::ITOVXmlDomNode* m_pDom;
    std::vector<ZEBXmlNode*> m_Children;
    int32_t m_Origin;
    int32_t m_Status;
    ZEBXmlNode* m_pOwner;

private:
    void DeleteChildren();
    /// The child whose DOM node is `dom`, or null. With `strict`, a child
    /// without a DOM node met on the way throws ZEB_E_NOTREADY; otherwise it
    /// is passed over.
    ZEBXmlNode* ChildHolding(UTIL::ITOVXmlDomNode* dom, bool strict) const;
    /// Binds `dom` and adds the wrapper as a child; unknown types are skipped.
    void AddBoundChild(UTIL::ITOVXmlDomNode* dom);
};

/// `node` as a `T` when it is one, else null: a check of the node's kind,
/// cheaper than a dynamic_cast on the paths that walk every child.
template <class T>
T* NodeAs(ZEBXmlNode* node) {
    return node && node->NodeKind() == T::kNodeKind ? static_cast<T*>(node) : nullptr;
}
template <class T>
const T* NodeAs(const ZEBXmlNode* node) {
    return node && node->NodeKind() == T::kNodeKind ? static_cast<const T*>(node) : nullptr;
}

}  // namespace XMLUtils
}  // namespace ZEB
