// Typed text comes through a hidden field, as a phone's keyboard does not tell its keys: what has
// changed in the field since the last look is typed or taken back in the program. So composed letters,
// suggestions and corrections all come right.
const typing = (function () {
  const field = document.getElementById('field');
  // Something to take back, or else the keyboard would not tell of its Backspace.
  const FILL = '\u00a0'.repeat(40);
  let known = FILL;
  let wanted = false;
  let pasted = '';

  function forget() {
    field.value = known = FILL;
    field.setSelectionRange(FILL.length, FILL.length);
  }

  function typeText(text) {
    if (text) events.push('text', { text: text });
  }

  function compare() {
    const before = Array.from(known);
    const now = Array.from(field.value);
    let same = 0;
    while (same < before.length && same < now.length && before[same] === now[same]) ++same;
    known = field.value;
    for (let i = same; i < before.length; ++i) events.push('key', { text: 'Backspace' });
    typeText(now.slice(same).join(''));
  }

  field.addEventListener('input', function (event) {
    compare();
    if (!event.isComposing && known.length < FILL.length / 2) forget();
  });
  field.addEventListener('compositionend', compare);
  document.addEventListener('paste', function (event) {
    event.preventDefault();
    pasted = event.clipboardData.getData('text/plain');
    if (wanted) events.push('key', { text: 'Ctrl+V' });
  });

  return {
    isWanted: function () { return wanted; },
    /** The caret has gone elsewhere, or the text has changed without the field. */
    forget: function () { if (wanted) forget(); },

    /** A finger has touched the text: a keyboard that was put away comes again. */
    callKeyboard: function (x, y) {
      const place = field.getBoundingClientRect();
      if (!wanted || x < place.left || x > place.right || y < place.top || y > place.bottom) return;
      field.blur();
      field.focus({ preventScroll: true });
    },

    /** Text is wanted at these pixels of the picture. */
    want: function (left, top, width, height) {
      field.style.left = left / 2.4 + '%';
      field.style.top = top / 2.94 + '%';
      field.style.width = width / 2.4 + '%';
      field.style.height = height / 2.94 + '%';
      field.disabled = false;
      if (!wanted) forget();
      wanted = true;
      if (document.activeElement !== field) field.focus({ preventScroll: true });
    },
    wantNot: function () {
      wanted = false;
      field.blur();
      field.disabled = true;
      typing.focus();
    },
    /** Keys go to the game again. */
    focus: function () { (wanted ? field : picture.canvas).focus({ preventScroll: true }); },

    clipboard: function () { return pasted; },
    setClipboard: function (text) {
      pasted = text;
      if (navigator.clipboard) navigator.clipboard.writeText(text).catch(function () {});
    },
  };
})();
