import QtQuick 2.6
import Quorvane.Pelkan 1.0

Page {
    onStatusChanged: console.log("e2e: second page " + ["inactive", "activating", "active", "deactivating"][status])
}
