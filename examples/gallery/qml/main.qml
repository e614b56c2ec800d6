import QtQuick 2.6
import Quorvane.Pelkan 1.0

// The gallery: an application built from the toolkit's components. The home page lists
// the subjects; each opens on a page of its own, swiped back to the home page or left with
// the Back key. A page about the gallery is attached to the right of the home page.
ApplicationWindow {
    id: app

    // Which subject the gallery opens on, over the home page: theme, images, orientation,
    // format, gestures, cover, form, dialog, lists, search, photos, tabs; "home" for none.
    property string startPage: "home"
    // Pictures on disk for the slideshow (set by the program).
    property var photos: []
    property int played: 0
    property int skipped: 0

    initialPage: Component { HomePage {} }
    cover: Component {
        GalleryCover {
            played: app.played
            skipped: app.skipped
            onPlayPressed: app.played++
            onNextPressed: app.skipped++
        }
    }

    Component.onCompleted: {
        if (startPage === "dialog")
            pageStack.currentPage.openDialog(PageStackAction.Immediate)
        else if (["lists", "form", "photos", "tabs", "backgrounds", "search"].indexOf(startPage) >= 0)
            pageStack.push(Qt.resolvedUrl({ "lists": "ListsPage.qml", "form": "FormPage.qml",
                                            "photos": "PhotosPage.qml", "tabs": "TabsPage.qml",
                                            "backgrounds": "BackgroundsPage.qml", "search": "SearchPage.qml" }[startPage]),
                           startPage === "photos" ? { "photos": photos } : {}, PageStackAction.Immediate)
        else if (startPage !== "home")
            pageStack.push(Qt.resolvedUrl("SubjectPage.qml"), { "name": startPage, "application": app },
                           PageStackAction.Immediate)
    }
}
