// The project file of the reference host: the model as JSON, keys in a fixed order.
#pragma once

#include "host/Json.h"
#include "host/Project.h"

// With bTrace the ordered log of host calls and events is included as "trace".
CJsonValue ProjectToJson(const CProject& project, bool bTrace);
