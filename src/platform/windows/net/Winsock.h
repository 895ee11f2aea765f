#pragma once

// The socket library's own header, whose calls are looked up at run time: none is called by its name here.

#include "winapi/Winapi.h"

#include <winsock2.h>

#undef h_addr
