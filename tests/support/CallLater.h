// Fault injection for nested loops: an action run from a thread timer, that is by
// whatever message loop is running when it comes due (a press loop, a modal box).
#pragma once

#include <windows.h>

#include <functional>

namespace orvane_test {

// Runs action once, ms milliseconds from now. Destroying the object first cancels it.
// Typical use: destroy a control while its loop runs, plus a later one that would end
// a loop still running (fired() then tells that the loop did not end by itself).
class CallLater
{
public:
    CallLater(UINT ms, std::function<void()> action);
    ~CallLater();
    CallLater(const CallLater&) = delete;
    CallLater& operator=(const CallLater&) = delete;

    bool fired() const { return m_fired; }

private:
    static void CALLBACK Expired(HWND, UINT, UINT_PTR id, DWORD);

    UINT_PTR m_id;
    std::function<void()> m_action;
    bool m_fired = false;
};

} // namespace orvane_test
