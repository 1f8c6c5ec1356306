// What happens on the page, oldest first, until the program takes it. The program sleeps in `wait`
// and is woken inside the handler of an event, so that it may open a page or bring up a keyboard, as
// browsers let only a person's own act do.
const events = (function () {
  // In the order of PageEventKind.
  const kinds = ['room', 'down', 'move', 'up', 'leave', 'wheel', 'key', 'text'];
  const waiting = [];
  let wake = null;
  let timer = 0;
  let text = '';

  function resume() {
    clearTimeout(timer);
    const woken = wake;
    wake = null;
    if (woken) woken();
  }

  return {
    /** Adds an event; wakes the program, unless it is busy and will look by itself. */
    push: function (kind, event) {
      waiting.push(Object.assign({ kind: kinds.indexOf(kind), x: 0, y: 0, wheel: 0, repeat: false, text: '' }, event));
      resume();
    },
    next: function () {
      const event = waiting.shift();
      if (event) text = event.text;
      return event;
    },
    /** Of the event that was taken last. */
    text: function () { return text; },
    wait: function (milliseconds, woken) {
      wake = woken;
      if (waiting.length) resume();
      else if (milliseconds >= 0) timer = setTimeout(resume, milliseconds);
    },
  };
})();
