pragma Singleton
import QtQuick 2.15

/** The music on board, and what of it is playing. It is a picture only: nothing is to be heard. */
QtObject {
    id: root

    readonly property var albums: [
        { title: "Low Tide", artist: "Harbour Lights", year: 2021, first: "#f2a65a", second: "#772f54", pattern: 0 },
        { title: "Paper Satellites", artist: "Nova Quiet", year: 2023, first: "#5b7cfa", second: "#1b1f5e", pattern: 1 },
        { title: "Night Bus Blues", artist: "The Lantern Four", year: 1998, first: "#2fb5c7", second: "#12384f", pattern: 2 },
        { title: "Twin Orbits", artist: "Ada Merrow", year: 2019, first: "#e86f8b", second: "#4a2a6a", pattern: 3 },
        { title: "Fernweh Radio", artist: "Kolibri Club", year: 2024, first: "#7bd389", second: "#14523f", pattern: 4 },
        { title: "Signal & Noise", artist: "Ochre", year: 2016, first: "#f06449", second: "#5b1a2e", pattern: 5 }
    ]
    readonly property var tracks: [
        { title: "Shoreline, 6 a.m.", seconds: 254, album: 0 },
        { title: "The Long Exit", seconds: 337, album: 2 },
        { title: "Half a Moon", seconds: 221, album: 3 },
        { title: "Antenna Song", seconds: 198, album: 1 },
        { title: "Last Tram Home", seconds: 302, album: 2 },
        { title: "Window Seat", seconds: 243, album: 4 },
        { title: "Copper Wire", seconds: 187, album: 5 },
        { title: "Slow Ferry", seconds: 276, album: 0 },
        { title: "Gravity, Gently", seconds: 231, album: 3 },
        { title: "Postcards", seconds: 209, album: 4 },
        { title: "Rain on Tin", seconds: 264, album: 2 },
        { title: "Parallel Lines", seconds: 195, album: 1 }
    ]

    property int currentIndex: 0
    property bool playing: true
    property bool shuffle: false
    property bool repeat: false
    property real position: 112 ///< seconds
    property string source: "usb"
    property var foreign ///< a track that is not on board, when such a one plays
    property string told ///< the last title that came from outside
    readonly property var currentTrack: root.foreign ? root.foreign : root.track(root.currentIndex)

    /** A track with all that is to be shown of it. */
    function track(index) {
        var data = root.tracks[(index + root.tracks.length) % root.tracks.length]
        var album = root.albums[data.album]
        return { title: data.title, seconds: data.seconds, artist: album.artist, album: album.title,
                 first: album.first, second: album.second, pattern: album.pattern }
    }

    /** Takes over what the car says is playing; to say the same again changes nothing. */
    function tell(data) {
        if (!data || !data.title || data.title === root.told)
            return
        root.told = data.title
        if (data.title === root.currentTrack.title)
            return
        var known = root.tracks.findIndex(function(track) { return track.title === data.title })
        root.select(known >= 0 ? known : root.currentIndex)
        if (known >= 0)
            return
        var album = root.albums[data.title.length % root.albums.length]
        root.foreign = { title: data.title, seconds: data.seconds || 240, artist: data.artist || album.artist,
                         album: album.title, first: album.first, second: album.second, pattern: album.pattern }
    }

    function select(index) {
        root.foreign = undefined
        root.currentIndex = (index + root.tracks.length) % root.tracks.length
        root.position = 0
        root.playing = true
    }

    /** Seconds as minutes and seconds. */
    function time(seconds) {
        var whole = Math.floor(seconds)
        return Math.floor(whole / 60) + ":" + (whole % 60 < 10 ? "0" : "") + whole % 60
    }

    readonly property Timer clock: Timer {
        interval: 1000
        repeat: true
        running: root.playing
        onTriggered: {
            if (root.position + 1 < root.currentTrack.seconds)
                root.position += 1
            else
                root.select(root.currentIndex + 1)
        }
    }
}
