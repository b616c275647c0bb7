// SPDX-License-Identifier: MIT
// The one macro that puts a name into the library's dynamic symbol table.
#pragma once

#include <QtCore/qglobal.h>

#ifdef PENWICK_BUILD
#define PENWICK_EXPORT Q_DECL_EXPORT
#else
#define PENWICK_EXPORT Q_DECL_IMPORT
#endif
