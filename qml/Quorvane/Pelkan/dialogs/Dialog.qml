import QtQuick 2.6
import Quorvane.Pelkan 1.0

// A page that asks for a decision: pushed on the page stack by open(), closed by accept()
// or reject(), by its header's buttons, or by a swipe (forward accepts, back rejects). Its
// status reads as a DialogStatus (Closed, Opening, Opened, Closing: the same values as the
// page's). accept() does nothing while canAccept is false.
Page {
    id: dialog

    property bool canAccept: true
    property int result: DialogResult.None
    readonly property bool _acceptsForward: true

    signal opened()
    signal accepted()
    signal rejected()
    signal done(int result)

    forwardNavigation: canAccept

    function open(properties, operationType) {
        var stack = pageStack || _findStack()
        if (!stack) {
            console.warn("Dialog: no page stack to open on")
            return
        }
        stack.push(dialog, properties, operationType)
    }

    function accept() {
        if (canAccept)
            _close(DialogResult.Accepted)
    }

    function reject() {
        _close(DialogResult.Rejected)
    }

    function _acceptBySwipe() {
        accept()
    }

    function _close(outcome) {
        if (result !== DialogResult.None)
            return
        _decide(outcome)
        if (pageStack && pageStack.currentPage === dialog)
            pageStack.pop()
    }

    function _decide(outcome) {
        result = outcome
        if (outcome === DialogResult.Accepted)
            accepted()
        else
            rejected()
        done(outcome)
    }

    function _findStack() {
        for (var item = parent; item; item = item.parent) {
            if (item.pageStack)
                return item.pageStack
        }
        return null
    }

    onStatusChanged: {
        if (status === DialogStatus.Opening)
            result = DialogResult.None
        else if (status === DialogStatus.Opened)
            opened()
        else if (status === DialogStatus.Closing && result === DialogResult.None)
            _decide(DialogResult.Rejected) // swiped back, or popped from outside
    }
}
