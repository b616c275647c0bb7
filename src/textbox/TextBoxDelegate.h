// SPDX-License-Identifier: MIT
// What a text box tells its owner.
#pragma once

#include <cstdint>

namespace penwick {

/// The owner of text boxes. Implemented by a QObject, so that a box can hold it weakly.
class TextBoxDelegate
{
public:
    virtual ~TextBoxDelegate() = default;

    /// The box whose hash() is `withHash` has removed itself from its superview; the owner drops
    /// it from its records.
    virtual void shouldDeleteTheTextBox(std::int64_t withHash) = 0;
};

} // namespace penwick
