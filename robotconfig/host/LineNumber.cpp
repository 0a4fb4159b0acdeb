#include "robotconfig/host/LineNumber.h"

const TLineNumber emptyLineNumber{0, -1};
const TLineNumber firstLineNumber{1, 0};
