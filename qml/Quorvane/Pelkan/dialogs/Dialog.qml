import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A page that asks for a decision: pushed on the page stack by open(), closed by accept()
// or reject(), by its header's buttons, or by a swipe (forward accepts, back rejects). Its
// status reads as a DialogStatus (Closed, Opening, Opened, Closing: the same values as the
// page's). accept() does nothing while canAccept is false. A decision made while the
// dialog still slides in lets it arrive first: opened() always comes before the outcome,
// and the outcome comes once the dialog has left the top of the stack.
Page {
    id: dialog

    // Whether the dialog may be accepted now (by accept(), its header or a forward swipe).
    property bool canAccept: true
    // How the dialog was closed: a DialogResult, None until it is.
    property int result: DialogResult.None

    signal opened()
    signal accepted()
    signal rejected()
    signal done(int result)

    forwardNavigation: canAccept

    // Pushes the dialog on the page stack of the page it is declared in.
    function open(properties, operationType) {
        var stack = pageStack || internal.findStack()
        if (!stack) {
            console.warn("Dialog: no page stack to open on")
            return
        }
        stack.push(dialog, properties, operationType)
    }

    function accept() {
        if (canAccept)
            internal.close(DialogResult.Accepted)
    }

    function reject() {
        internal.close(DialogResult.Rejected)
    }

    onStatusChanged: {
        if (status === DialogStatus.Opening)
            result = DialogResult.None
        else if (status === DialogStatus.Opened)
            opened()
        else if (status === DialogStatus.Closing && result === DialogResult.None)
            internal.decide(DialogResult.Rejected) // swiped back, or popped from outside
    }

    QtObject {
        id: internal

        // The dialog goes first, then the outcome is told: what a handler of it does (a
        // push, say) comes after.
        function close(outcome) {
            if (dialog.result !== DialogResult.None)
                return
            if (dialog.pageStack && dialog.pageStack.currentPage === dialog) {
                dialog.pageStack.completeAnimation() // opened() comes before the outcome
                dialog.result = outcome
                dialog.pageStack.pop()
            }
            decide(outcome)
        }

        function decide(outcome) {
            dialog.result = outcome
            if (outcome === DialogResult.Accepted)
                dialog.accepted()
            else
                dialog.rejected()
            dialog.done(outcome)
        }

        function findStack() {
            for (var item = dialog.parent; item; item = item.parent) {
                if (item.pageStack)
                    return item.pageStack
            }
            return null
        }
    }
}
