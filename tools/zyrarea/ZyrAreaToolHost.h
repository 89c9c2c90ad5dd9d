// The module brought up inside the tool the way a host brings it up: texts, classes and the
// service, with both calculation algorithms attached to the white board.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <memory>

class ZyrAppHdx;

class ZyrAreaToolHost {
public:
    // Registering the classes twice in one process is harmless; the service is taken by one
    // client for the life of the host.
    ZyrAreaToolHost();
    ~ZyrAreaToolHost();
    ZyrAreaToolHost(const ZyrAreaToolHost&) = delete;
    ZyrAreaToolHost& operator=(const ZyrAreaToolHost&) = delete;

    // eSuccess when the service runs and both algorithms are attached.
    Hsys::ErrorStatus status() const { return m_status; }

private:
    Hsys::ErrorStatus attachAlgorithms();

    std::unique_ptr<ZyrAppHdx> m_client;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
};
