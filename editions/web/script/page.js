// The page around the table.
const page = (function () {
  const voice = document.getElementById('voice');
  const ended = document.getElementById('ended');
  const fullScreen = document.getElementById('full_screen');

  document.getElementById('again').addEventListener('click', function () { location.reload(); });

  fullScreen.hidden = !document.fullscreenEnabled;
  fullScreen.addEventListener('click', function () {
    if (document.fullscreenElement) document.exitFullscreen();
    else document.documentElement.requestFullscreen();
    typing.focus();
  });

  if ('serviceWorker' in navigator && window.isSecureContext) {
    navigator.serviceWorker.register('worker.js').catch(function () {});  // played from the network then
  }

  let room = '';
  function measure() {
    const ratio = window.devicePixelRatio;
    const place = picture.roomPlace();
    const size = { x: Math.max(1, Math.round(place.width * ratio)), y: Math.max(1, Math.round(place.height * ratio)) };
    const text = size.x + ' ' + size.y + ' ' + ratio;
    if (text === room) return;
    room = text;
    events.push('room', size);
  }
  /** A window may come to a sharper display without becoming another size. */
  function watchSharpness() {
    const same = window.matchMedia('(resolution: ' + window.devicePixelRatio + 'dppx)');
    same.addEventListener('change', function () {
      measure();
      watchSharpness();
    }, { once: true });
  }
  watchSharpness();
  window.addEventListener('resize', measure);
  if (window.visualViewport) window.visualViewport.addEventListener('resize', measure);
  measure();
  picture.canvas.focus({ preventScroll: true });

  /** Has a reader of the screen say this, also a second time. */
  function say(text) { voice.textContent = text === voice.textContent ? text + '\u00a0' : text; }

  function showEnd(text) {
    document.body.classList.add('has_ended');
    ended.querySelector('p').textContent = text;
    ended.hidden = false;
    document.getElementById('again').focus();
    say(text);
  }
  /** A program that is broken, or could not be loaded, answers no more: only a new start helps. */
  function seeWhetherBroken(thrown) {
    if (thrown instanceof WebAssembly.RuntimeError) showEnd('The game broke down. What you confirmed is kept.');
  }
  window.addEventListener('error', function (event) { seeWhetherBroken(event.error); });
  window.addEventListener('unhandledrejection', function (event) { seeWhetherBroken(event.reason); });

  return {
    say: say,

    /** One page of help for all that is asked; false where the browser does not let it open. */
    open: function (address) {
      const opened = window.open(address, 'help');
      if (opened) opened.focus();
      return opened !== null;
    },

    end: function () {
      if (window.matchMedia('(display-mode: standalone)').matches) window.close();
      showEnd('The game has ended');
    },
  };
})();
