#include "robotconfig/checker/Finding.h"

const char *severityWord(TSeverity nSeverity) {
  switch (nSeverity) {
    case TSeverity::kNote: return "note";
    case TSeverity::kWarning: return "warning";
    case TSeverity::kError: return "error";
  }
  return "error";
}
