// SPDX-License-Identifier: MIT
// penwick-host: the smallest application that opens a drawing window, and the way in for scripts.
#include "Host.h"

int main(int argumentCount, char **arguments)
{
    return penwick::host::runHost(argumentCount, arguments);
}
