import QtQml.Models 2.15

/** The contacts of the driver's phone, by name. */
ListModel {
    id: root

    /** Where a contact of that name is, or whose name begins like that; -1: nobody. */
    function find(name) {
        for (let i = 0; i < root.count; ++i) {
            const known = root.get(i).name
            if (known === name || known.startsWith(name + " "))
                return i
        }
        return -1
    }

    /** What is known of a caller, for whom there may be no contact. */
    function caller(name) {
        const i = root.find(name)
        return i >= 0 ? root.get(i)
                      : { name: name, mobile: "", work: "", town: "", tint: "#4a5968", favourite: false }
    }

    function favourites() {
        const found = []
        for (let i = 0; i < root.count; ++i) {
            if (root.get(i).favourite)
                found.push(i)
        }
        return found
    }

    ListElement { name: "Ann Marlow"; mobile: "0155 018 2240"; work: "0155 018 9900"; town: "14 Orchard Way"; tint: "#3d7ea6"; favourite: true }
    ListElement { name: "Ben Tarrow"; mobile: "0155 014 7719"; work: "0155 014 3000"; town: "Quayside 3"; tint: "#8a6a3f"; favourite: true }
    ListElement { name: "Carla Windt"; mobile: "0155 017 0462"; work: ""; town: "College Road 27"; tint: "#7a5aa0"; favourite: true }
    ListElement { name: "Doctor Elmsby"; mobile: ""; work: "0155 010 4411"; town: "Westbank Clinic"; tint: "#4c8a72"; favourite: false }
    ListElement { name: "Edda Quill"; mobile: "0155 013 6650"; work: ""; town: "Linden Avenue 8"; tint: "#a3596c"; favourite: true }
    ListElement { name: "Farid Osten"; mobile: "0155 012 8173"; work: "0155 012 8000"; town: "Harbour Street 40"; tint: "#55699f"; favourite: false }
    ListElement { name: "Garage Northgate"; mobile: ""; work: "0155 010 7070"; town: "Northgate 5"; tint: "#5f6f7e"; favourite: false }
    ListElement { name: "Home"; mobile: ""; work: "0155 018 2241"; town: "14 Orchard Way"; tint: "#3f8f86"; favourite: true }
    ListElement { name: "Iris Pellam"; mobile: "0155 016 9925"; work: ""; town: "Mill Lane 51"; tint: "#9a5f8f"; favourite: false }
    ListElement { name: "Jonas Averill"; mobile: "0155 011 2038"; work: "0155 011 2000"; town: "Station Road 12"; tint: "#6f8a45"; favourite: true }
    ListElement { name: "Kim Solberry"; mobile: "0155 019 5586"; work: ""; town: "Vine Street 19"; tint: "#3d7ea6"; favourite: false }
    ListElement { name: "Lotte Varn"; mobile: "0155 015 3347"; work: ""; town: "Old Wall 6"; tint: "#a06a4a"; favourite: false }
    ListElement { name: "Milo Hasker"; mobile: "0155 013 1192"; work: "0155 013 1000"; town: "Eastern Avenue 74"; tint: "#7a5aa0"; favourite: false }
    ListElement { name: "Office"; mobile: ""; work: "0155 012 8000"; town: "Harbour Street 40"; tint: "#5f6f7e"; favourite: false }
    ListElement { name: "Petra Lund-Amsel"; mobile: "0155 017 7204"; work: ""; town: "Orchard Way 60"; tint: "#4c8a72"; favourite: false }
}
