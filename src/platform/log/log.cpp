#include "platform/log/log.h"
