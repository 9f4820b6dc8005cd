#include "platform/queue/queue.h"
