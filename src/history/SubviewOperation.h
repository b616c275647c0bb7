// SPDX-License-Identifier: MIT
// The order to take text boxes off the canvas, as it travels in a notification.
#pragma once

#include <QVariant>

#include <cstdint>
#include <optional>

namespace penwick {

/// Which subviews of the canvas are to leave it. A canvas without subviews ignores every case.
struct SubviewOperation
{
    /// The spelling of the cases is fixed, the small letters inside the last three included.
    enum class Case
    {
        removeWithId, ///< the first text box whose hash is `identifier`; none if none matches
        removefirst, ///< the first subview, whatever its kind
        removelast, ///< the last subview, whatever its kind
        removeall,
    };

    Case operation = Case::removeWithId;
    std::int64_t identifier = 0; ///< meaningful for removeWithId only, 0 otherwise

    [[nodiscard]] static SubviewOperation removeWithId(std::int64_t identifier)
    {
        return { Case::removeWithId, identifier };
    }

    /// The form in which it is posted: a map {"removeWithId": identifier as qlonglong}, or the
    /// case's name as a string.
    [[nodiscard]] QVariant toVariant() const;

    /// Reads toVariant()'s form back; nothing for anything else.
    [[nodiscard]] static std::optional<SubviewOperation> fromVariant(const QVariant &object);

    friend bool operator==(const SubviewOperation &, const SubviewOperation &) = default;
};

} // namespace penwick
