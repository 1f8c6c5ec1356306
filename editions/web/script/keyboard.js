// Keys as chords, such as "Enter" or "Alt+B". What the browser wants for itself is left to it.
(function () {
  const NAMES = {
    Enter: 'Enter', Escape: 'Escape', Tab: 'Tab', Backspace: 'Backspace', Delete: 'Delete', Insert: 'Insert',
    ArrowUp: 'Up', ArrowDown: 'Down', ArrowLeft: 'Left', ArrowRight: 'Right', Home: 'Home', End: 'End',
    PageUp: 'PageUp', PageDown: 'PageDown', F1: 'F1', F4: 'F4', F10: 'F10', ' ': 'Space',
  };
  // With Ctrl: what works on a text.
  const EDITING = ['A', 'C', 'X', 'Insert', 'Delete', 'Backspace', 'Left', 'Right', 'Home', 'End'];

  /** What a key means: digits whichever layer they lie on, and a letter's place where none is Latin. */
  function nameOf(event) {
    if (event.key === 'Dead' || event.key === 'Process') return '';  // a part of a letter to come
    if (NAMES[event.key]) return NAMES[event.key];
    const place = /^(Digit|Key)(.)$/.exec(event.code);
    const sign = event.key.length === 1 ? event.key.toUpperCase() : '';
    if (sign >= 'A' && sign <= 'Z') return sign;
    if (place && !/[+=-]/.test(sign) && (place[1] === 'Digit' ? place[2] !== '0' : sign > '~' || event.altKey)) return place[2];
    return sign > ' ' && sign <= '~' ? sign : '';
  }

  /** The chord that the program gets; empty where the key is not for it. */
  function chordOf(event) {
    const name = nameOf(event);
    const typesByAlt = event.getModifierState('AltGraph') ||
      (typing.isWanted() && event.altKey && event.key.length === 1 && event.key > '~');
    const pastes = typing.isWanted() && event.shiftKey && name === 'Insert';
    if (!name || event.metaKey || event.isComposing || typesByAlt || pastes) return '';
    if (event.ctrlKey && !(typing.isWanted() && EDITING.includes(name))) return '';
    return (event.ctrlKey ? 'Ctrl+' : '') + (event.altKey ? 'Alt+' : '') + (event.shiftKey ? 'Shift+' : '') + name;
  }

  window.addEventListener('keydown', function (event) {
    if (event.target.closest('a, button')) return;
    const chord = chordOf(event);
    if (!chord) return;
    const types = typing.isWanted() && event.key.length === 1 && !event.ctrlKey && !event.altKey;
    if (!types) {
      event.preventDefault();
      typing.forget();
    }
    events.push('key', { text: chord, repeat: event.repeat });
  });
})();
