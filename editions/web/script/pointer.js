// Mouse, stylus and finger as events, in pixels of the display within the room.
(function () {
  const canvas = picture.canvas;
  const NOTCH = 100;  // of a wheel, in the page's units
  const LINE = 33;
  let turned = 0;

  function put(kind, event, wheel) {
    const room = picture.roomPlace();
    events.push(kind, {
      x: Math.floor((event.clientX - room.left) * window.devicePixelRatio),
      y: Math.floor((event.clientY - room.top) * window.devicePixelRatio),
      wheel: wheel || 0,
    });
  }

  canvas.addEventListener('pointerdown', function (event) {
    event.preventDefault();  // the keyboard stays where it is
    if (!event.isPrimary || event.button !== 0) return;
    canvas.setPointerCapture(event.pointerId);
    if (!typing.isWanted()) canvas.focus({ preventScroll: true });
    typing.forget();
    put('down', event);
  });
  canvas.addEventListener('pointermove', function (event) {
    if (event.isPrimary && (event.buttons & 1 || event.pointerType === 'mouse')) put('move', event);
  });
  canvas.addEventListener('pointerup', function (event) {
    if (!event.isPrimary || event.button !== 0) return;
    put('up', event);
    if (event.pointerType === 'touch') typing.callKeyboard(event.clientX, event.clientY);
  });
  // The system has taken the finger for itself: nothing is pushed.
  canvas.addEventListener('pointercancel', function (event) {
    if (event.isPrimary) events.push('up', { x: -1e5, y: -1e5 });
  });
  canvas.addEventListener('pointerleave', function (event) {
    if (event.isPrimary) events.push('leave', {});
  });
  canvas.addEventListener('wheel', function (event) {
    if (event.ctrlKey) return;
    event.preventDefault();
    turned -= event.deltaMode ? event.deltaY * LINE : event.deltaY;
    const notches = Math.trunc(turned / NOTCH);
    if (!notches) return;
    turned -= notches * NOTCH;
    put('wheel', event, notches);
  }, { passive: false });

  // No menu, zoom or marked text by a long press, two fingers or a double tap.
  ['contextmenu', 'selectstart', 'gesturestart', 'dblclick'].forEach(function (kind) {
    document.addEventListener(kind, function (event) { event.preventDefault(); });
  });
  document.addEventListener('touchmove', function (event) { event.preventDefault(); }, { passive: false });
})();
