// The host's services to the object database: which database the user works in.
#pragma once

class HsDbDatabase;

class HsDbHostApplicationServices {
public:
    // Null when there is none. A database that is destroyed stops being the working one.
    HsDbDatabase* workingDatabase() const { return m_workingDatabase; }
    void setWorkingDatabase(HsDbDatabase* database) { m_workingDatabase = database; }

private:
    HsDbDatabase* m_workingDatabase = nullptr;
};

// The services of the process.
HsDbHostApplicationServices* hsdbHostApplicationServices();
