// The scope in which the white board may be changed: construction refreshes the board for the open
// databases, destruction marks it stale again.
#pragma once

class ZyrAreaCalculationWhiteBoard;

class ZyrAreaCalculationWhiteBoardPtr {
public:
    // Without services, board or base service the pointer stays null.
    ZyrAreaCalculationWhiteBoardPtr();
    ~ZyrAreaCalculationWhiteBoardPtr();
    ZyrAreaCalculationWhiteBoardPtr(const ZyrAreaCalculationWhiteBoardPtr&) = delete;
    ZyrAreaCalculationWhiteBoardPtr& operator=(const ZyrAreaCalculationWhiteBoardPtr&) = delete;

    // Throws std::runtime_error on a null pointer.
    ZyrAreaCalculationWhiteBoard* operator->() const;

private:
    ZyrAreaCalculationWhiteBoard* m_board = nullptr;
};
