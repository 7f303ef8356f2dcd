#include "platform/language/language.h"

BOOL SystemParametersInfo(UINT action, NONCLIENTMETRICS& metrics) {
    if (action != SPI_GETNONCLIENTMETRICS)
        return FALSE;
    metrics = NONCLIENTMETRICS();
    return TRUE;
}

void KhLangGetUserFont(const NONCLIENTMETRICS& metrics, LOGFONT* font) {
    *font = metrics.message;
}
