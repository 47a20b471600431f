#pragma once

#include <stdbool.h>

/* What this process has, as the system and the C library tell it. */
void print_state(void);

/* Remembers the addresses that the shared library of that name is loaded at. */
bool remember_addresses(const char* library);

/* Whether it is still loaded. */
bool is_loaded(const char* library);

/* Takes the remembered addresses, so that whoever still goes there ends the process, and nothing is loaded
 * there again. Returns how many ranges they are, or -1. */
int haunt(void);
