#pragma once
// The handler result lives with the framework's event-handler interface.
#include "platform/glob/EventHandler.h"
