// Whatever the program fetches is of the same version as this script.
Module['locateFile'] = function (name) { return name + new URL(document.currentScript.src).search; };
