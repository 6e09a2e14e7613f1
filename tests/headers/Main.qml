import QtQuick 2.15
import HmiStateMachine 1.0

Item {
    ScreenHost {
        ViewComponent {
            viewId: "Home"
            Item { objectName: "home screen" }
        }
    }
    PopupHost { }
}
