import QtQml.Models 2.15

/** Places that can be found, with where they are on the map. */
ListModel {
    id: root

    /** The names that begin with a text, or have a word that does; at most as many as asked for. */
    function matching(text, most) {
        const wanted = text.trim().toLowerCase()
        const found = []
        for (let i = 0; i < root.count && found.length < most; ++i) {
            const name = root.get(i).name.toLowerCase()
            if (name.startsWith(wanted) || name.indexOf(" " + wanted) >= 0)
                found.push(i)
        }
        return found
    }

    ListElement { name: "Orchard Way"; detail: "14 · Orchards"; icon: "home"; distance: "21 km"; px: 2150; py: 200 }
    ListElement { name: "Harbour Office"; detail: "Harbour Street 40"; icon: "work"; distance: "2.4 km"; px: 1500; py: 1085 }
    ListElement { name: "Central Station"; detail: "Station Road 1"; icon: "train"; distance: "1.9 km"; px: 1056; py: 1150 }
    ListElement { name: "Orchard Market"; detail: "Orchard Way 2"; icon: "local_grocery_store"; distance: "3.2 km"; px: 1560; py: 500 }
    ListElement { name: "Old Orchard Inn"; detail: "Canal Walk 7"; icon: "restaurant"; distance: "4.1 km"; px: 1610; py: 300 }
    ListElement { name: "Alder Concert Hall"; detail: "Quayside 12"; icon: "theater_comedy"; distance: "1.1 km"; px: 1010; py: 790 }
    ListElement { name: "Museum of the River"; detail: "Castle Park"; icon: "museum"; distance: "0.6 km"; px: 1275; py: 708 }
    ListElement { name: "Linden Hill Baths"; detail: "Linden Avenue 31"; icon: "pool"; distance: "2.8 km"; px: 1440; py: 1160 }
    ListElement { name: "Eastmere Lake"; detail: "Eastmere Park"; icon: "park"; distance: "5.0 km"; px: 1860; py: 820 }
    ListElement { name: "Northgate Garage"; detail: "Northgate 5"; icon: "local_parking"; distance: "1.4 km"; px: 1150; py: 330 }
}
