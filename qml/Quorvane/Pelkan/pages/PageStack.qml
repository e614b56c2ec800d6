import QtQuick 2.6
import Quorvane.Pelkan 1.0
import Quorvane.Pelkan.private 1.0 as Private

// Pages on top of each other, the top one shown. A back swipe (or the Back key) pops; a
// forward swipe reaches the page attached to the right of the top one with pushAttached(),
// or accepts a dialog. The pages follow the finger through the native flick differences;
// a release past half the stack, or a quick flick, completes the move, anything else
// returns. Pages may be given as components, URLs, instances, or "Module.Page" names.
PageStackBase {
    id: stack

    // Operations run this long when animated.
    property int transitionDuration: 300
    readonly property Item previousPage: _top > 0 && _containers[_top - 1] ? _containers[_top - 1].page : null
    // The page attached to the right of the current one, reached by a forward swipe.
    readonly property Item nextPage: _currentContainer && _currentContainer.attached ? _currentContainer.attached.page : null

    property var _containers: []
    property int _top: -1
    // The offset an animation or a released finger holds; the live swipe adds to it.
    property real _settle: 0
    readonly property real _offset: _settle + (horizontalNavigationStyle ? _leftFlickDifference - _rightFlickDifference
                                                                         : _upFlickDifference - _downFlickDifference)
    readonly property real _extent: horizontalNavigationStyle ? width : height
    // The ApplicationWindow the stack belongs to (set by the window); its pages read it as
    // Page.applicationWindow.
    property Item applicationWindow: null
    property double _pressTime: 0
    // The clock gestures are timed by, in milliseconds; tests give their own.
    property var _now: function() { return Date.now() }
    property var _afterTransition: null

    focus: true
    backNavigation: !!currentPage && currentPage.backNavigation !== false && depth > 1
    forwardNavigation: !!currentPage && currentPage.forwardNavigation !== false
                       && (!!(_currentContainer && _currentContainer.attached) || currentPage._acceptsForward === true)
    navigationStyle: currentPage && currentPage.navigationStyle !== undefined ? currentPage.navigationStyle : PageNavigation.Horizontal

    function push(page, properties, operationType) {
        var container = _make(page, properties, _containers.length)
        if (!container)
            return null
        var previous = _topContainer()
        _containers.push(container)
        _transition(previous, container, +1, operationType)
        return container.page
    }

    function pushAttached(page, properties) {
        var top = _topContainer()
        if (!top)
            return push(page, properties, PageStackAction.Immediate)
        if (top.attached)
            _discard(top.attached)
        top.attached = _make(page, properties, top.index + 1)
        if (top.attached)
            top.attached.owner = top
        return top.attached ? top.attached.page : null
    }

    function navigateForward(operationType) {
        var top = _topContainer()
        if (!top || !top.attached)
            return null
        var next = top.attached
        top.attached = null
        next.owner = null
        _containers.push(next)
        _transition(top, next, +1, operationType)
        return next.page
    }

    // pop([page], [operationType]): pops the top page, or every page above the given one;
    // returns the page popped last. (Declared without parameters so that the Back key
    // can call it from C++.)
    function pop() {
        var page = arguments[0]
        var operationType = arguments[1]
        if (typeof page === "number") {
            operationType = page
            page = undefined
        }
        if (_containers.length < 2)
            return null
        var target = _containers.length - 2
        if (page) {
            target = _indexOf(page)
            if (target < 0 || target === _containers.length - 1)
                return null
        }
        var top = _topContainer()
        var removed = _containers.splice(target + 1, _containers.length - target - 2)
        for (var i = 0; i < removed.length; ++i)
            _discard(removed[i])
        _transition(top, _containers[target], -1, operationType)
        return top.page
    }

    function replace(page, properties, operationType) {
        var container = _make(page, properties, Math.max(0, _containers.length - 1))
        if (!container)
            return null
        var previous = _topContainer()
        if (previous)
            _containers.splice(_containers.length - 1, 1)
        _containers.push(container)
        _transition(previous, container, +1, operationType, true)
        return container.page
    }

    function clear() {
        while (_containers.length > 0)
            _discard(_containers.pop())
        _sync()
    }

    function find(predicate) {
        for (var i = _containers.length - 1; i >= 0; --i) {
            if (predicate(_containers[i].page))
                return _containers[i].page
        }
        return null
    }

    function completeAnimation() {
        if (settleAnimation.running)
            settleAnimation.complete()
    }

    function _topContainer() {
        return _containers.length > 0 ? _containers[_containers.length - 1] : null
    }

    function _indexOf(page) {
        for (var i = 0; i < _containers.length; ++i) {
            if (_containers[i].page === page)
                return i
        }
        return -1
    }

    function _make(page, properties, index) {
        var container = containerComponent.createObject(stack, { "stack": stack, "index": index })
        var item = null
        var owns = true
        if (page instanceof Item) {
            item = page
            owns = false
            container.originalParent = page.parent
            page.parent = container
            for (var name in properties)
                page[name] = properties[name]
        } else {
            var component = page
            if (typeof page === "string" || page instanceof String) {
                var url = String(page)
                // "Module.Page" or "Module/Page": a page listed in a module's qmldir.
                if (url.indexOf(":") < 0 && !/\.qml$/.test(url))
                    url = resolveImportPage(url.replace(/\//g, "."))
                component = Qt.createComponent(url)
            }
            if (!component || component.status === Component.Error) {
                console.warn("PageStack: cannot load page:", component ? component.errorString() : page)
                container.destroy()
                return null
            }
            item = component.createObject(container, properties || {})
            if (!item) {
                console.warn("PageStack: cannot create page:", component.errorString())
                container.destroy()
                return null
            }
        }
        container.page = item
        container.ownsPage = owns
        item.visible = true
        if (item.hasOwnProperty("pageStack"))
            item.pageStack = stack
        return container
    }

    function _discard(container) {
        if (!container)
            return
        if (container.attached)
            _discard(container.attached)
        var page = container.page
        if (page && page.hasOwnProperty("status"))
            page.status = PageStatus.Inactive
        if (page && !container.ownsPage) {
            page.visible = false
            page.parent = container.originalParent
        }
        container.destroy()
    }

    function _setStatus(container, status) {
        if (container && container.page && container.page.hasOwnProperty("status"))
            container.page.status = status
    }

    // Moves from one top page to another: +1 when the new one comes from the right (push),
    // -1 when it was below (pop). Statuses run Activating/Deactivating first, then
    // Active/Inactive once the pages have settled.
    function _transition(from, to, direction, operationType, replaced) {
        completeAnimation()
        _setStatus(from, PageStatus.Deactivating)
        _setStatus(to, PageStatus.Activating)
        var finish = function() {
            _setStatus(from, PageStatus.Inactive)
            _setStatus(to, PageStatus.Active)
            if (from && (direction < 0 || replaced))
                _discard(from)
            if (to && to.page)
                to.page.forceActiveFocus()
        }
        if (direction < 0) {
            // The top page leaves to the right (or bottom), then goes.
            _animate(_extent, function() {
                var at = _containers.indexOf(from)
                if (at >= 0)
                    _containers.splice(at, 1)
                _sync()
                _settle = 0
                finish()
            }, operationType)
        } else {
            _sync()
            if (from && !replaced)
                _settle += _extent // the old top still in view; the new one beside it
            _animate(0, finish, operationType)
        }
    }

    function _animate(target, done, operationType) {
        if (operationType === PageStackAction.Immediate || !visible || transitionDuration <= 0) {
            _settle = target
            done()
            return
        }
        _afterTransition = done
        _ongoingTransitionCount = _ongoingTransitionCount + 1
        settleAnimation.to = target
        settleAnimation.duration = transitionDuration * Math.min(1, Math.abs(target - _settle) / Math.max(1, _extent))
        settleAnimation.start()
    }

    function _sync() {
        for (var i = 0; i < _containers.length; ++i)
            _containers[i].index = i
        var top = _topContainer()
        if (top && top.attached)
            top.attached.index = _containers.length
        _top = _containers.length - 1
        depth = _containers.length
        _currentContainer = top
        currentPage = top ? top.page : null
    }

    onPressed: _pressTime = _now()
    onReleased: {
        // Where the finger let go becomes where the pages rest, then they move on.
        var back = horizontalNavigationStyle ? _leftFlickDifference : _upFlickDifference
        var forward = horizontalNavigationStyle ? _rightFlickDifference : _downFlickDifference
        var moved = back > 0 ? back : forward
        if (moved <= 0)
            return
        // Past half the way, or a quick flick: a pixel per millisecond at the theme's scale.
        var elapsed = Math.max(1, _now() - _pressTime)
        var complete = moved > _extent / 2 || (moved / elapsed > Theme.pixelRatio && moved > Theme.paddingLarge)
        _settle = back > 0 ? back : -forward
        if (!complete)
            _animate(0, function() {}, PageStackAction.Animated)
        else if (back > 0)
            pop()
        else if (_currentContainer.attached)
            navigateForward()
        else
            _animate(0, function() { currentPage._acceptBySwipe() }, PageStackAction.Animated)
    }
    onCanceled: {
        var offset = horizontalNavigationStyle ? _leftFlickDifference - _rightFlickDifference
                                               : _upFlickDifference - _downFlickDifference
        _settle = _settle + offset
        _animate(0, function() {}, PageStackAction.Animated)
    }

    NumberAnimation {
        id: settleAnimation
        target: stack
        property: "_settle"
        easing.type: Easing.OutQuad
        onStopped: {
            stack._ongoingTransitionCount = Math.max(0, stack._ongoingTransitionCount - 1)
            var done = stack._afterTransition
            stack._afterTransition = null
            if (done)
                done()
        }
    }

    Component {
        id: containerComponent
        Private.PageContainer {}
    }

    // Nothing under the pages reacts while they move.
    TouchBlocker {
        anchors.fill: parent
        z: 1000
        enabled: stack.busy
        visible: enabled
    }
}
