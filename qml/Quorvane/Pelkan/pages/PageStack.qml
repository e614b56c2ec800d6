import QtQuick 2.12
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Pages on top of each other, the top one shown. A back swipe (or the Back key) pops; a
// forward swipe reaches the page attached to the right of the top one with pushAttached(),
// or accepts a dialog. The pages follow the finger through the native flick differences;
// a release past half the stack, or a quick flick, completes the move, anything else
// returns. Pages may be given as components, URLs, items, or "Module.Page" names; anything
// else is refused with a warning and leaves the stack as it was.
//
// Calls in quick succession all take effect, in the order they were made:
// - Each call changes the stack at once: depth, currentPage, previousPage and nextPage
//   read the new state when the call returns, and push() returns the new page.
// - What the user sees and the pages' statuses follow one move at a time. A call made
//   while a move slides (a push, a pop, the pages settling after a released finger)
//   first completes that move at once: its pages jump to rest, the page left behind
//   turns Inactive (and goes, if it was popped), the new top turns Active. Then the call's
//   own move starts. A finger that touches the pages while they slide does the same.
// - A call made from a page's status handler waits until the move that changed the
//   status has finished, then runs as the next move; moves followed by another run at
//   once, only the last one slides.
// So every page's status runs Inactive, Activating, Active, Deactivating, Inactive, in
// that order, and `busy` is true exactly while a move slides.
//
// Popped pages made by the stack are destroyed on their own, while still in place and
// hidden, so that nothing inside them sees its parent go. Items the application pushed
// are hidden and given back to the parent they had.
PageStackBase {
    id: stack

    // How long an animated move takes, in milliseconds.
    property int transitionDuration: 300
    // The page below the current one.
    readonly property Item previousPage: internal.previousPage
    // The page attached to the right of the current one, reached by a forward swipe.
    readonly property Item nextPage: internal.nextPage
    // The clock swipes are timed by: a function returning milliseconds. A quick swipe
    // completes a move even when it is short; tests give a clock of their own.
    property var clock: function() { return Date.now() }
    // The ApplicationWindow the stack shows its pages in (the window sets it; a stack in one
    // finds it itself); its pages read it as Page.applicationWindow.
    property Item applicationWindow: null

    focus: true
    backNavigation: !!currentPage && currentPage.backNavigation !== false && depth > 1
    forwardNavigation: !!currentPage && currentPage.forwardNavigation !== false
                       && (!!internal.nextPage || currentPage instanceof Dialog)
    navigationStyle: currentPage && currentPage.navigationStyle !== undefined ? currentPage.navigationStyle : PageNavigation.Horizontal

    // push(page, [properties], [operationType]): puts page on top; returns it.
    function push(page, properties, operationType) {
        var entry = internal.make(page, properties, "push")
        if (!entry)
            return null
        var from = internal.top()
        internal.entries.push(entry)
        internal.changed({ "from": from, "to": entry, "animated": operationType !== PageStackAction.Immediate })
        return entry.page
    }

    // Attaches page to the right of the top page (replacing one attached before), to be
    // reached by a forward swipe or navigateForward(); returns it.
    function pushAttached(page, properties) {
        var top = internal.top()
        if (!top)
            return push(page, properties, PageStackAction.Immediate)
        var entry = internal.make(page, properties, "pushAttached")
        if (!entry)
            return null
        var replaced = top.attached
        top.attached = entry
        internal.release(replaced)
        internal.changed(null)
        return entry.page
    }

    // Moves on to the page attached to the top one; returns it, or null without one.
    function navigateForward(operationType) {
        var top = internal.top()
        if (!top || !top.attached)
            return null
        var next = top.attached
        top.attached = null
        internal.entries.push(next)
        internal.changed({ "from": top, "to": next, "animated": operationType !== PageStackAction.Immediate })
        return next.page
    }

    // pop([page], [operationType]): pops the top page, or every page above the given one;
    // returns the page that was on top. (Declared without parameters so that the Back key
    // can call it from C++.)
    function pop() {
        var page = arguments[0]
        var operationType = arguments[1]
        if (typeof page === "number") {
            operationType = page
            page = undefined
        }
        var entries = internal.entries
        var target = entries.length - 2
        if (page)
            target = internal.indexOf(page)
        if (target < 0 || target >= entries.length - 1)
            return null
        var removed = entries.splice(target + 1, entries.length - target - 1)
        var from = removed[removed.length - 1]
        internal.changed({ "from": from, "to": entries[target], "pop": true, "gone": removed,
                           "animated": operationType !== PageStackAction.Immediate })
        return from.page
    }

    // replace(page, [properties], [operationType]): puts page in place of the top page;
    // returns it.
    function replace(page, properties, operationType) {
        var entries = internal.entries
        if (entries.length === 0)
            return push(page, properties, operationType)
        var entry = internal.make(page, properties, "replace")
        if (!entry)
            return null
        var from = entries.pop()
        entries.push(entry)
        internal.changed({ "from": from, "to": entry, "gone": [from],
                           "animated": operationType !== PageStackAction.Immediate })
        return entry.page
    }

    // Removes every page at once.
    function clear() {
        var entries = internal.entries
        if (entries.length === 0)
            return
        var removed = entries.splice(0, entries.length)
        internal.changed({ "from": removed[removed.length - 1], "to": null, "gone": removed, "animated": false })
    }

    // The topmost page for which predicate(page) is true, or null.
    function find(predicate) {
        for (var i = internal.entries.length - 1; i >= 0; --i) {
            if (predicate(internal.entries[i].page))
                return internal.entries[i].page
        }
        return null
    }

    // Brings a sliding move to its end at once.
    function completeAnimation() {
        internal.run(true)
    }

    onPressed: {
        // A finger on sliding pages brings them where they were going; the blocker under
        // it keeps the touch for the stack to follow.
        if (internal.move) {
            internal.holding = true
            internal.run(true)
        }
        internal.pressTime = clock()
        internal.following = true
    }
    onReleased: {
        var back = horizontalNavigationStyle ? _leftFlickDifference : _upFlickDifference
        var forward = horizontalNavigationStyle ? _rightFlickDifference : _downFlickDifference
        internal.letGo()
        var moved = back > 0 ? back : forward
        if (moved <= 0)
            return
        // Past half the way, or a quick flick: a pixel per millisecond at the theme's scale.
        var elapsed = Math.max(1, clock() - internal.pressTime)
        if (moved > internal.extent / 2 || (moved / elapsed > Theme.pixelRatio && moved > Theme.paddingLarge)) {
            if (back > 0)
                pop()
            else if (internal.nextPage)
                navigateForward()
            else if (currentPage instanceof Dialog)
                currentPage.accept()
        }
        if (!internal.move && internal.queue.length === 0 && internal.settle !== 0)
            internal.changed({ "animated": true }) // back to rest
    }
    onCanceled: {
        internal.letGo()
        internal.changed({ "animated": true })
    }

    QtObject {
        id: internal

        // The stack, bottom first: { page, owns, originalParent, attached }.
        property var entries: []
        // Moves not yet shown, in call order: { from, to, pop, gone, animated }; one
        // without pages brings the pages back to rest.
        property var queue: []
        // The move sliding now, or null.
        property var move: null
        property bool running: false
        property Item previousPage: null
        property Item nextPage: null
        property var shown: []
        property double pressTime: 0

        // Where the pages rest relative to their places, along the navigation axis; the
        // finger adds its distance while it drags.
        property real settle: 0
        property bool following: false
        property bool holding: false
        readonly property real offset: settle + (following ? (stack.horizontalNavigationStyle
                                                               ? stack._leftFlickDifference - stack._rightFlickDifference
                                                               : stack._upFlickDifference - stack._downFlickDifference) : 0)
        readonly property real extent: stack.horizontalNavigationStyle ? stack.width : stack.height

        onOffsetChanged: place()
        onExtentChanged: place()

        function top() {
            return entries.length > 0 ? entries[entries.length - 1] : null
        }

        function indexOf(page) {
            for (var i = 0; i < entries.length; ++i) {
                if (entries[i].page === page)
                    return i
            }
            return -1
        }

        function alive(item) {
            return !!item && item.parent !== undefined // a destroyed item reads undefined
        }

        // Whether an entry still on the stack (or attached to one) shows this item.
        function holds(item) {
            for (var i = 0; i < entries.length; ++i) {
                if (entries[i].page === item || (entries[i].attached && entries[i].attached.page === item))
                    return true
            }
            return false
        }

        function describe(value) {
            if (typeof value === "string")
                return JSON.stringify(value)
            if (value === null || typeof value !== "object")
                return String(value)
            if (value.objectName !== undefined)
                return String(value) // an object: its type and address
            try {
                return JSON.stringify(value)
            } catch (e) {
                return String(value)
            }
        }

        function findWindow() {
            for (var item = stack.parent; item; item = item.parent) {
                if (item instanceof Private.Window)
                    return item
            }
            return null
        }

        function make(page, properties, call) {
            var item = null
            var component = null
            if (page instanceof Item) {
                if (holds(page)) {
                    console.warn("PageStack." + call + ": " + describe(page) + " is on the stack already")
                    return null
                }
                item = page
            } else if (page instanceof Component) {
                component = page
            } else if ((typeof page === "string" || page instanceof String) && String(page).length > 0) {
                var url = String(page)
                // "Module.Page" or "Module/Page": a page listed in a module's qmldir.
                if (url.indexOf(":") < 0 && !/\.qml$/.test(url))
                    url = resolveImportPage(url.replace(/\//g, "."))
                component = Qt.createComponent(url)
            } else {
                console.warn("PageStack." + call + ": cannot take " + describe(page)
                             + ": a page is a component, URL, item or page name")
                return null
            }
            var entry = { "page": item, "owns": !item, "originalParent": item ? item.parent : null, "attached": null }
            if (item) {
                item.parent = stack
                for (var name in properties)
                    item[name] = properties[name]
            } else {
                if (component.status !== Component.Ready) {
                    console.warn("PageStack." + call + ": cannot load page:", component.errorString())
                    return null
                }
                entry.page = component.createObject(stack, properties || {})
                if (!entry.page) {
                    console.warn("PageStack." + call + ": cannot create page:", component.errorString())
                    return null
                }
            }
            item = entry.page
            item.visible = false
            if (item.pageStack !== undefined)
                item.pageStack = stack
            return entry
        }

        // Lets an entry go once nothing shows it: pages the stack made are destroyed as
        // they are, still in place, so that no binding inside them sees its parent go;
        // the application's items are hidden and given back.
        function release(entry) {
            if (!entry)
                return
            release(entry.attached)
            var item = entry.page
            if (!alive(item) || holds(item))
                return
            if (entry.owns) {
                item.destroy()
            } else {
                item.visible = false
                item.parent = entry.originalParent
            }
        }

        function setStatus(entry, status) {
            if (entry && alive(entry.page) && entry.page.status !== undefined)
                entry.page.status = status
        }

        // After every change of the stack: publishes it, and queues its move.
        function changed(move) {
            var top = internal.top()
            stack.depth = entries.length
            stack._currentContainer = top ? top.page : null // a page is its own container
            stack.currentPage = top ? top.page : null
            previousPage = entries.length > 1 ? entries[entries.length - 2].page : null
            nextPage = top && top.attached ? top.attached.page : null
            if (move) {
                queue.push(move)
                run(false)
            } else {
                place()
            }
        }

        // Shows the queued moves in order. A new move completes the sliding one at once;
        // only the last move slides. Calls made from the status handlers it runs (nested
        // in here) queue their moves, taken up by the loop below.
        function run(completeSliding) {
            if (running)
                return
            running = true
            try {
                if (completeSliding && move)
                    finish(move)
                while (queue.length > 0) {
                    if (move)
                        finish(move)
                    var next = queue.shift()
                    var slides = next.animated && stack.visible && stack.transitionDuration > 0 && extent > 0
                    begin(next, slides)
                    if (slides && queue.length === 0 && settle !== 0) {
                        slide.to = 0
                        slide.duration = Math.max(1, stack.transitionDuration * Math.min(1, Math.abs(settle) / extent))
                        slide.start()
                        break
                    }
                    finish(next)
                }
            } finally {
                running = false
            }
        }

        function begin(next, slides) {
            if (next.to !== undefined) {
                // The page left keeps its place; the new top comes in beside it: from the
                // right for a push, from the left for a pop (from the right too where the
                // finger took the page left, as a forward swipe accepting a dialog does).
                var direction = next.pop && settle >= 0 ? -1 : 1
                next.direction = direction
                if (next.from && next.to)
                    settle += direction * extent
            }
            move = next
            if (slides && settle !== 0)
                stack._ongoingTransitionCount = 1
            place()
            if (next.from !== next.to) {
                setStatus(next.from, PageStatus.Deactivating)
                setStatus(next.to, PageStatus.Activating)
            }
        }

        function finish(done) {
            slide.stop()
            move = null
            stack._ongoingTransitionCount = 0
            settle = 0
            place()
            if (done.from !== done.to) {
                setStatus(done.from, PageStatus.Inactive)
                setStatus(done.to, PageStatus.Active)
            }
            var gone = done.gone || []
            for (var i = 0; i < gone.length; ++i)
                release(gone[i])
            if (done.to && done.to === top() && alive(done.to.page))
                done.to.page.forceActiveFocus()
        }

        // Puts the pages in view where they belong and hides every other: the top page,
        // the one below it and the one attached to it at rest; the two pages of a move
        // while it slides.
        function place() {
            var slots = []
            if (move && move.to !== undefined) {
                if (move.to)
                    slots.push(move.to, 0)
                if (move.from && move.from !== move.to)
                    slots.push(move.from, -move.direction)
            } else {
                var at = entries.length - 1
                if (at >= 0) {
                    slots.push(entries[at], 0)
                    if (at > 0)
                        slots.push(entries[at - 1], -1)
                    if (entries[at].attached)
                        slots.push(entries[at].attached, 1)
                }
            }
            var horizontal = stack.horizontalNavigationStyle
            var now = []
            for (var i = 0; i < slots.length; i += 2) {
                var item = slots[i].page
                var position = slots[i + 1] * extent + offset
                if (!alive(item) || Math.abs(position) >= extent)
                    continue
                item.x = horizontal ? position : 0
                item.y = horizontal ? 0 : position
                item.visible = true
                now.push(item)
            }
            for (var j = 0; j < shown.length; ++j) {
                if (now.indexOf(shown[j]) < 0 && alive(shown[j]) && shown[j].parent === stack)
                    shown[j].visible = false
            }
            shown = now
        }

        // The finger is off: where it left the pages is where they rest until they move on.
        function letGo() {
            settle = offset
            following = false
            holding = false
        }
    }

    NumberAnimation {
        id: slide
        target: internal
        property: "settle"
        easing.type: Easing.OutQuad
        onFinished: internal.run(true)
    }

    // Nothing under the pages reacts while they move.
    TouchBlocker {
        anchors.fill: parent
        z: 1000
        enabled: stack.busy || internal.holding
        visible: enabled
    }
    Component.onCompleted: {
        if (!applicationWindow)
            applicationWindow = internal.findWindow()
    }
}
