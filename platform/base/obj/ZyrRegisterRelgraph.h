// The load guard that tells the relationship graph about an object whose fields were read.
#pragma once

class HsDbBdfFiler;
class HsDbObject;
class HsRxClass;
class HsRxObject;

// Built at the top of every bdfInFields, public or implementation, and destroyed when it returns.
// The object is the one being read, or an implementation object nested in it; both stand for the
// public object at the top. Only the outermost guard of a read of that public object acts: when
// it ends, the graph of the object's database (if one was made) notes that the object's
// references may have changed. So a drawing that is loaded, an undo that puts fields back and a
// copy read into an object all leave the graph current, whatever class was read.
class ZyrRegisterRelgraph {
public:
    ZyrRegisterRelgraph(HsDbBdfFiler* filer, const HsRxObject* object, const HsRxClass* cls);
    // Never lets an exception pass.
    ~ZyrRegisterRelgraph();
    ZyrRegisterRelgraph(const ZyrRegisterRelgraph&) = delete;
    ZyrRegisterRelgraph& operator=(const ZyrRegisterRelgraph&) = delete;

private:
    // The public object whose read this guard is the outermost of, else null.
    const HsDbObject* m_outermostOf = nullptr;
};
