#include "CallLater.h"

#include <map>

namespace orvane_test {

namespace {
std::map<UINT_PTR, CallLater*>& Pending()
{
    static std::map<UINT_PTR, CallLater*> pending;
    return pending;
}
} // namespace

CallLater::CallLater(UINT ms, std::function<void()> action)
    : m_id(::SetTimer(nullptr, 0, ms, &CallLater::Expired)), m_action(std::move(action))
{
    Pending()[m_id] = this;
}

CallLater::~CallLater()
{
    ::KillTimer(nullptr, m_id);
    Pending().erase(m_id);
}

void CALLBACK CallLater::Expired(HWND, UINT, UINT_PTR id, DWORD)
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

} // namespace orvane_test
