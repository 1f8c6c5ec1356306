// The functions that the program calls: see web_page.h and web_storage.h.
mergeInto(LibraryManager['library'], {
  $newText__deps: ['malloc'],
  $newText: function (text) {
    const size = lengthBytesUTF8(text) + 1;
    const at = _malloc(size);
    stringToUTF8(text, at, size);
    return at;
  },

  page_next_event: function (at) {
    const event = events.next();
    if (!event) return 0;
    HEAP32.set([event.kind, event.x, event.y, event.wheel, event.repeat ? 1 : 0], at >> 2);
    return 1;
  },
  page_event_text__deps: ['$newText'],
  page_event_text: function () { return newText(events.text()); },
  page_wait__deps: ['$Asyncify'],
  page_wait: function (milliseconds) {
    return Asyncify.handleSleep(function (wake) { events.wait(milliseconds, wake); });
  },

  page_show: function (pixels, width, height) {
    picture.show(HEAPU32.subarray(pixels >> 2, (pixels >> 2) + width * height), width, height);
  },
  page_place: function (left, top, width, height) { picture.place(left, top, width, height); },

  page_ticks: function () { return performance.now(); },
  page_local_time: function (at) {
    const now = new Date();
    HEAP32.set([now.getFullYear(), now.getMonth() + 1, now.getDate(), now.getHours(), now.getMinutes(),
      now.getSeconds()], at >> 2);
  },

  page_want_text: function (left, top, width, height) { typing.want(left, top, width, height); },
  page_want_no_text: function () { typing.wantNot(); },
  page_clipboard__deps: ['$newText'],
  page_clipboard: function () { return newText(typing.clipboard()); },
  page_set_clipboard: function (text) { typing.setClipboard(UTF8ToString(text)); },
  page_say: function (text) { page.say(UTF8ToString(text)); },
  page_open: function (address) { return page.open(UTF8ToString(address)) ? 1 : 0; },
  page_end: function () { page.end(); },

  page_stored__deps: ['$newText'],
  page_stored: function (beginning) {
    const list = storage.read(UTF8ToString(beginning));
    return list === null ? 0 : newText(list + '\0');
  },
  page_store: function (beginning, list) {
    const texts = [];
    while (HEAPU8[list]) {
      for (let i = 0; i < 2; ++i) {
        const text = UTF8ToString(list);
        texts.push(text);
        list += lengthBytesUTF8(text) + 1;
      }
    }
    return storage.write(UTF8ToString(beginning), texts) ? 1 : 0;
  },
});
