// Here the plug-in libraries get the accessors that they export.

#include "plugin/launch_records.h"
