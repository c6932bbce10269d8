// Defines the entry table from the generated list of bodies.
#include "entry.h"

#include "entry_table.inc"
