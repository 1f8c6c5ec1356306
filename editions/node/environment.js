// The program sees the environment that it was started in.
Module['preRun'] = function () { Object.assign(ENV, process.env); };
