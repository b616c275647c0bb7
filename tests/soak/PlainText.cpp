// SPDX-License-Identifier: MIT
#include "soak/PlainText.h"

namespace penwick::test {

bool isReplaced(const std::string &before, const std::string &put, const std::string &now)
{
    if (now.size() < put.size())
        return false;
    for (std::size_t from = 0; from + put.size() <= now.size() && from <= before.size(); ++from) {
        const std::string rest = now.substr(from + put.size());
        if (now.compare(from, put.size(), put) == 0 && from + rest.size() <= before.size()
            && before.ends_with(rest))
            return true;
        if (from == before.size() || from == now.size() || now[from] != before[from])
            return false; // what stands before the stretch is as it was
    }
    return false;
}

void PlainText::append(const std::string &put)
{
    m_now += put;
    m_isTouched = true;
    m_stood.insert(m_now);
}

void PlainText::backspace()
{
    if (!m_now.empty())
        m_now.pop_back();
    m_isTouched = true;
    m_stood.insert(m_now);
}

// Whatever is typed, pasted, dropped, cut or deleted takes the place of what is selected.
void PlainText::replace(const std::string &put)
{
    m_isTouched = true;
    m_may = [before = m_now, put](const auto &now) { return isReplaced(before, put, now); };
}

// How many letters go back together is the editor's choice; that they stood there is not.
void PlainText::goBack()
{
    m_isTouched = true;
    m_may = [this](const auto &now) { return m_stood.count(now) > 0; };
}

// What is selected makes way for a composition, which is not yet text.
void PlainText::compose(const std::string &half)
{
    replace("");
    m_composed = half;
}

void PlainText::commit(const std::string &whole)
{
    if (whole.empty() && m_composed.empty())
        return;
    replace(whole);
    m_now += whole; // at the end until its place is known, because the box is not empty any more
    m_composed.clear();
}

// A key that an input method let through may end what it composed.
void PlainText::adopt(const std::string &now, const std::string &composed)
{
    if (!m_may)
        return;
    if (m_may(now)) {
        m_now = now;
        m_stood.insert(now);
        if (composed.empty())
            m_composed.clear();
    }
    m_may = nullptr;
}

} // namespace penwick::test
