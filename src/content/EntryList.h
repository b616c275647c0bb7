// SPDX-License-Identifier: MIT
// An array that is a value and cheap to copy.
// The canvas view takes a copy of the content on every pointer event. That must not cost more as
// the drawing grows, and a copy must not change when the original does.
#pragma once

#include "platform/foundation/FatalError.h"

#include <algorithm>
#include <cstddef>
#include <deque>
#include <iterator>
#include <memory>
#include <optional>
#include <utility>

namespace penwick {

/// An array whose copies share what they have in common.
///
/// Copying, append(), removeLast() and changing the last entry cost the same at every length,
/// whether or not copies are alive. removeAt() in the middle costs a walk over the list, and so
/// does the first append() after a removeLast() if a copy still has the removed entry.
///
/// All entries but the last live in a store that copies share and that only grows while it is
/// shared; a list sees its first m_settledCount entries. The last one is held by the list itself,
/// so it may change freely. An entry removed while a copy is alive may be kept alive by the store
/// until either list changes again. One thread only. An index outside the list is a fatal error.
template <class T>
class EntryList
{
public:
    /// Walks a list, oldest entry first. Valid until its list changes; a change of a copy does
    /// not matter.
    class Iterator
    {
    public:
        using iterator_category = std::forward_iterator_tag;
        using value_type = T;
        using difference_type = std::ptrdiff_t;
        using pointer = const T *;
        using reference = const T &;

        Iterator() = default;
        Iterator(const EntryList *list, int index)
            : m_list(list)
            , m_index(index)
        { }

        reference operator*() const { return (*m_list)[m_index]; }
        pointer operator->() const { return &(*m_list)[m_index]; }
        Iterator &operator++()
        {
            ++m_index;
            return *this;
        }
        Iterator operator++(int) { return { m_list, m_index++ }; }
        friend bool operator==(const Iterator &, const Iterator &) = default;

    private:
        const EntryList *m_list = nullptr;
        int m_index = 0;
    };

    EntryList() = default;
    EntryList(const EntryList &) = default;
    EntryList &operator=(const EntryList &) = default;
    /// Leaves `other` empty.
    EntryList(EntryList &&other) noexcept { swap(other); }
    EntryList &operator=(EntryList &&other) noexcept
    {
        EntryList(std::move(other)).swap(*this);
        return *this;
    }
    ~EntryList() = default;

    [[nodiscard]] bool isEmpty() const { return !m_last; }
    [[nodiscard]] int size() const { return m_last ? m_settledCount + 1 : 0; }

    [[nodiscard]] const T &operator[](int index) const
    {
        requireIndex(index);
        return index == m_settledCount ? *m_last : (*m_settled)[static_cast<std::size_t>(index)];
    }
    [[nodiscard]] const T &first() const { return (*this)[0]; }
    [[nodiscard]] const T &last() const { return (*this)[m_settledCount]; }
    /// The last entry, to be changed in this list alone.
    [[nodiscard]] T &mutableLast()
    {
        requireIndex(m_settledCount);
        return *m_last;
    }

    [[nodiscard]] Iterator begin() const { return { this, 0 }; }
    [[nodiscard]] Iterator end() const { return { this, size() }; }

    /// How many entries, from the first on, this list and `other` surely have in common, because
    /// they share a store. The entries are not compared, so more of them may be equal.
    [[nodiscard]] int sharedStart(const EntryList &other) const
    {
        return m_settled == other.m_settled ? std::min(m_settledCount, other.m_settledCount) : 0;
    }

    /// The index of the first entry, from the front, for which `predicate` holds.
    template <class Predicate>
    [[nodiscard]] std::optional<int> firstIndexWhere(Predicate predicate) const
    {
        for (int index = 0; index < size(); ++index) {
            if (predicate((*this)[index]))
                return index;
        }
        return std::nullopt;
    }

    void append(T entry)
    {
        if (m_last) {
            makeRoomInStore();
            m_settled->push_back(*std::move(m_last));
            ++m_settledCount;
        }
        m_last = std::move(entry);
    }

    void removeLast()
    {
        requireIndex(m_settledCount);
        if (m_settledCount == 0) {
            clear();
            return;
        }
        --m_settledCount;
        m_last = (*m_settled)[static_cast<std::size_t>(m_settledCount)];
        if (m_settled.use_count() == 1)
            dropWhatNobodySees();
    }

    /// Later entries move down one place.
    void removeAt(int index)
    {
        requireIndex(index);
        if (index == m_settledCount) {
            removeLast();
            return;
        }
        auto rest = std::make_shared<Store>();
        for (int kept = 0; kept < m_settledCount; ++kept) {
            if (kept != index)
                rest->push_back((*this)[kept]);
        }
        m_settled = std::move(rest);
        --m_settledCount;
    }

    void swap(EntryList &other) noexcept
    {
        m_settled.swap(other.m_settled);
        std::swap(m_settledCount, other.m_settledCount);
        m_last.swap(other.m_last);
    }

    void clear()
    {
        m_settled.reset();
        m_settledCount = 0;
        m_last.reset();
    }

private:
    // A deque, because growing it leaves references into it valid: a walk over a copy goes on
    // while the original is appended to.
    using Store = std::deque<T>;

    void requireIndex(int index) const
    {
        if (index < 0 || index >= size())
            platform::fatalError("an index lies outside the list");
    }

    [[nodiscard]] auto settledEnd() const { return m_settled->begin() + m_settledCount; }

    void dropWhatNobodySees() { m_settled->erase(settledEnd(), m_settled->end()); }

    // Afterwards the store ends where this list's settled entries end.
    void makeRoomInStore()
    {
        if (!m_settled)
            m_settled = std::make_shared<Store>();
        else if (m_settled.use_count() == 1)
            dropWhatNobodySees();
        else if (m_settled->size() != static_cast<std::size_t>(m_settledCount))
            m_settled = std::make_shared<Store>(m_settled->begin(), settledEnd());
    }

    std::shared_ptr<Store> m_settled;
    int m_settledCount = 0; // 0 while there is no last entry
    std::optional<T> m_last;
};

} // namespace penwick
