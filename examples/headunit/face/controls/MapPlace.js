.pragma library

// Where on its way the car is, in metres. All maps share it, and it outlives the screens they are on.
var travelled = 372
