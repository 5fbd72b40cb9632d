// Placeholder until the engine is built: every conversion fails.
#include "huekit.h"

extern "C" int HUEKIT_fromSpectralToCIEXYZ(const float*, int, int, float*) { return 1; }
extern "C" int HUEKIT_fromSpectralToDensity(const float*, int, int, float*, int) { return 1; }
extern "C" int HUEKIT_fromCIEXYZToCIELAB(const float*, float*) { return 1; }
extern "C" int HUEKIT_fromCIELABToCIEXYZ(const float*, float*) { return 1; }
