#include "platform/defaults/userdefaults.h"
