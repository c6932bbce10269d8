// Compiles the public header as C++ with every warning an error, in the
// project's own standard and (see tests/CMakeLists.txt) in C++11, so that
// C++ users of any age include it cleanly.
#include "pvxi.h"

// Pointers to a declaration of each kind, with external linkage so that none
// is unused.
extern PvxStatus (*const pvxCxxHeaderConvert)(const Pvx32f*, int, Pvx8u*, int, PvxiSize, int);
PvxStatus (*const pvxCxxHeaderConvert)(const Pvx32f*, int, Pvx8u*, int, PvxiSize, int) = pvxiConvert_32f8u_C1R;
extern const PvxVersionRecord* (*const pvxCxxHeaderVersion)();
const PvxVersionRecord* (*const pvxCxxHeaderVersion)() = pvxiGetLibVersion;
extern const char* (*const pvxCxxHeaderStatusText)(PvxStatus);
const char* (*const pvxCxxHeaderStatusText)(PvxStatus) = pvxGetStatusString;
