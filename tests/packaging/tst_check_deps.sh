#!/bin/sh
# scripts/check-deps on a small tree beside the real one: it passes as the tree stands and
# names the file, the import or program and the package once a package is taken out of
# scripts/install-deps or debian/control.
# Usage: tests/packaging/tst_check_deps.sh [source-dir]
set -eu
source=$(cd "${1:-$(dirname "$0")/../..}" && pwd)
scratch=$(mktemp -d "${TMPDIR:-/tmp}/pelkan-check-deps.XXXXXX")
trap 'rm -rf "$scratch"' EXIT INT TERM

make_tree() {
    rm -rf "$scratch/tree"
    mkdir -p "$scratch/tree/scripts" "$scratch/tree/debian" "$scratch/tree/qml/lists" \
        "$scratch/tree/tests" "$scratch/tree/benchmarks" "$scratch/tree/src"
    cp "$source/scripts/install-deps" "$scratch/tree/scripts/"
    cp "$source/debian/control" "$scratch/tree/debian/"
    printf 'import QtQuick 2.6\nimport QtQml.Models 2.2\nimport Quorvane.Pelkan.private 1.0\nItem {}\n' \
        > "$scratch/tree/qml/lists/ListItem.qml"
    printf 'import QtTest 1.2\nimport PelkanTest 1.0\nimport "../qml/lists"\nTestCase {}\n' > "$scratch/tree/tests/tst_list.qml"
    printf 'void f() { qmlRegisterType<T>("PelkanTest", 1, 0, "T"); }\n' > "$scratch/tree/tests/main.cpp"
    printf 'const char *document = "import QtQml 2.0;import %%1 %%2.%%3;QtObject {}";\n' > "$scratch/tree/src/stack.cpp"
    printf 'const char *peer = "import QtQuick 2.6\\nimport org.kde.kirigami 2.10 as Kirigami\\n";\n' > "$scratch/tree/benchmarks/main.cpp"
    printf '#!/bin/sh\n# mmdebstrap in a comment is no call\ndbus-run-session -- xvfb-run -a true\n' > "$scratch/tree/scripts/run"
    # Named before scripts/run, neither calls xvfb-run: a pattern, a message, a here-document
    # and another language.
    printf '#!/bin/sh\ngrep -E '"'"'xvfb-run|true'"'"' "$1"\necho "xvfb-run is needed"\ncat <<EOF\nxvfb-run\nEOF\n' \
        > "$scratch/tree/scripts/patterns"
    printf '#!/usr/bin/env python3\nprint("xvfb-run")\n' > "$scratch/tree/scripts/a-tool"
}

failed=0
rows=0
# Row: name, file changed, sed program, what the check must print ("" for a pass).
while IFS='@' read -r name file program expected; do
    rows=$((rows + 1))
    make_tree
    if [ -n "$file" ]; then
        cp "$scratch/tree/$file" "$scratch/before"
        sed -i -E "$program" "$scratch/tree/$file"
        if cmp -s "$scratch/before" "$scratch/tree/$file"; then
            echo "FAIL $name: $file has no such package any more; update this test"
            failed=$((failed + 1))
            continue
        fi
    fi
    status=0
    "$source/scripts/check-deps" "$scratch/tree" > "$scratch/out" 2>&1 || status=$?
    if [ -z "$expected" ] && [ "$status" -eq 0 ]; then
        echo "PASS $name"
    elif [ -n "$expected" ] && [ "$status" -eq 1 ] && grep -qF -- "$expected" "$scratch/out"; then
        echo "PASS $name"
    else
        echo "FAIL $name: exit $status, expected ${expected:-a pass}; printed:"
        cat "$scratch/out"
        failed=$((failed + 1))
    fi
done <<'ROWS'
as it stands@@@
models module left out of install-deps@scripts/install-deps@s/(^|[[:space:]])qml-module-qtqml-models2([[:space:]]|$)/\1\2/@qml/lists/ListItem.qml:2: import QtQml.Models 2.2 comes from qml-module-qtqml-models2, which scripts/install-deps does not install
models module left out of the runtime package@debian/control@/^[[:space:]]+qml-module-qtqml-models2,$/d@qml/lists/ListItem.qml:2: import QtQml.Models 2.2 comes from qml-module-qtqml-models2, on which qml-module-quorvane-pelkan does not depend
test module left out of install-deps@scripts/install-deps@s/(^|[[:space:]])qml-module-qttest([[:space:]]|$)/\1\2/@tests/tst_list.qml:1: import QtTest 1.2 comes from qml-module-qttest, which scripts/install-deps does not install
benchmark peer left out of --bench@scripts/install-deps@s/(^|[[:space:]])qml-module-org-kde-kirigami2([[:space:]"]|$)/\1\2/@benchmarks/main.cpp:1: import org.kde.kirigami 2.10 comes from qml-module-org-kde-kirigami2, which scripts/install-deps --bench does not install
program left out of install-deps@scripts/install-deps@s/(^|[[:space:]])xvfb([[:space:]]|$)/\1\2/@scripts/run: xvfb-run comes from xvfb, which scripts/install-deps does not install
package build tool left out of install-deps@scripts/install-deps@s/(^|[[:space:]])build-essential([[:space:]]|$)/\1\2/@debian/control: the package build needs build-essential, which scripts/install-deps does not install
uninstalled peer named by Debian's rule@benchmarks/main.cpp@s/as Kirigami/as Kirigami\\nimport QtQuick.Particles 2.0/@benchmarks/main.cpp:1: import QtQuick.Particles 2.0 comes from qml-module-qtquick-particles2, which scripts/install-deps --bench does not install
module no package has@tests/tst_list.qml@s/^import QtTest 1.2$/import Unheard.Of 1.0/@tests/tst_list.qml:1: import Unheard.Of 1.0: no such module
ROWS
echo "$((rows - failed)) passed, $failed failed"
[ "$failed" -eq 0 ]
