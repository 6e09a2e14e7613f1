.pragma library

// Whom the driver touched or who rings: the event that leads to the next screen does not say it.
var name = "Ann Marlow"

// Who is on the line; empty before the first call.
var caller = ""
