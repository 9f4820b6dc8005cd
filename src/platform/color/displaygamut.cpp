#include "platform/color/displaygamut.h"
