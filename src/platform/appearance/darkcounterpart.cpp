#include "platform/appearance/darkcounterpart.h"
