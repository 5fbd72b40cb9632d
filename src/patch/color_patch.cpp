#include "redavudeva/color_patch.h"
