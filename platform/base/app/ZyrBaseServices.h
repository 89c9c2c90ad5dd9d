// The sibling modules' common service: a count of client modules, and the per-database helpers
// (relationship graph, display and migration managers) that later layers add to it.
#pragma once

#include "platform/host/db/HsDbDatabaseReactor.h"
#include "platform/host/rx/HsRxService.h"

#include <map>
#include <memory>

class HsDbDatabase;
class ZyrAppHdx;
class ZyrObjRelGraph;

// What an editor (a user interface around the drawings) offers the objects. A batch run has none.
class ZyrEditorServices {
public:
    virtual ~ZyrEditorServices() = default;
    // True while the editor itself is redrawing the database, so objects must not ask for a redraw.
    virtual bool isRegenerating(HsDbDatabase* database) const = 0;
};

class ZyrBaseServices : public HsRxService, private HsDbDatabaseReactor {
    HSRX_DECLARE_MEMBERS(ZyrBaseServices)

public:
    ZyrBaseServices();
    // Takes its relationship graphs with it.
    ~ZyrBaseServices() override;

    static constexpr const wchar_t* kServiceName = L"ZyrBaseServices";

    // The service while any module is registered with it, else null.
    static ZyrBaseServices* service();
    // The first client creates the service and enters it in the service dictionary; every client
    // adds a dependency. eNullPointer for a null application.
    static Hsys::ErrorStatus registerService(ZyrAppHdx* app);
    // Removes the client's dependency; the last one takes the service out and deletes it.
    // eNullPointer for a null application, eDoesNotApply when no service is running.
    static Hsys::ErrorStatus unRegisterService(ZyrAppHdx* app);

    ZyrEditorServices* editorServices() const { return m_editor; }
    // Installed by a host that has an editor; not owned.
    void setEditorServices(ZyrEditorServices* editor) { m_editor = editor; }

    // The relationship graph of a database, made on the first request and gone with the database
    // or with the service. Null for a null database.
    ZyrObjRelGraph* objRelGraph(HsDbDatabase* database);
    // The graph made for a database, or null when none was asked for yet.
    ZyrObjRelGraph* findObjRelGraph(const HsDbDatabase* database) const;

private:
    void goodbye(HsDbDatabase* database) override;

    ZyrEditorServices* m_editor = nullptr;
    std::map<HsDbDatabase*, std::unique_ptr<ZyrObjRelGraph>, std::less<>> m_graphs;
};
