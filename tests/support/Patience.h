#pragma once

#include <QTest>

// Sets how long the tests wait for what they expect: long enough for a machine whose processors are busy with
// other work. A test that passes waits only until the expected has happened. QtTest's own macros wait for 5
// s.
constexpr int PATIENCE_MS = 180000;

#undef QTRY_VERIFY
#define QTRY_VERIFY(expression) QTRY_VERIFY_WITH_TIMEOUT((expression), PATIENCE_MS)
#undef QTRY_VERIFY2
#define QTRY_VERIFY2(expression, message) QTRY_VERIFY2_WITH_TIMEOUT((expression), (message), PATIENCE_MS)
#undef QTRY_COMPARE
#define QTRY_COMPARE(expression, expected) QTRY_COMPARE_WITH_TIMEOUT((expression), (expected), PATIENCE_MS)
