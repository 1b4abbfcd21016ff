#pragma once

// Numbers of the property page and of what stands on it, for its template and its code.
#define ZANDOR_PAGE 102
#define ZANDOR_PAGE_LIST 1001
#define ZANDOR_PAGE_LABEL 1002
#define ZANDOR_PAGE_TEXT 1003
#define ZANDOR_PAGE_FLAG 1004
