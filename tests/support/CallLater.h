// Fault injection for nested loops: an action run from a thread timer, that is by
// whatever message loop is running when it comes due (a press loop, a modal box).
// With a second, later one that would end a loop still running, fired() tells whether
// the loop ended by itself. Destroying the object first cancels the action.
#pragma once

#include <windows.h>

#include <functional>
#include <map>

namespace orvane_test {

class CallLater
{
public:
    CallLater(UINT ms, std::function<void()> action)
        : m_id(::SetTimer(nullptr, 0, ms, &CallLater::Expired)), m_action(std::move(action)) { Pending()[m_id] = this; }
    ~CallLater() { ::KillTimer(nullptr, m_id); Pending().erase(m_id); }
    CallLater(const CallLater&) = delete;
    CallLater& operator=(const CallLater&) = delete;
    bool fired() const { return m_fired; }

private:
    static std::map<UINT_PTR, CallLater*>& Pending()
    {
        static std::map<UINT_PTR, CallLater*> s_pending;
        return s_pending;
    }
    static void CALLBACK Expired(HWND, UINT, UINT_PTR id, DWORD)
    {
        ::KillTimer(nullptr, id);
        auto it = Pending().find(id);
        if (it == Pending().end())
            return;
        CallLater* self = it->second;
        Pending().erase(it);
        self->m_fired = true;
        self->m_action();
    }

    UINT_PTR m_id;
    std::function<void()> m_action;
    bool m_fired = false;
};

} // namespace orvane_test
