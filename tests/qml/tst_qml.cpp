#include <QtQuickTest>

// Runs every tst_*.qml file in this folder against the modules of the build tree.
QUICK_TEST_MAIN(pelkan)
