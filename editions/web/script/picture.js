// The picture on the page: kept as it is, drawn at the next whole multiple of its size, and reduced
// by the browser to the place that the program has found for it in the room.
const picture = (function () {
  const room = document.getElementById('room');
  const table = document.getElementById('table');
  const canvas = document.getElementById('picture');
  const target = canvas.getContext('2d', { alpha: false });
  const small = document.createElement('canvas');
  const source = small.getContext('2d', { alpha: false });
  let image = null;
  let pixels = null;
  let place = null;

  function draw() {
    if (!image || !place) return;
    target.imageSmoothingEnabled = false;
    target.drawImage(small, 0, 0, canvas.width, canvas.height);
  }

  function keepSize(width, height) {
    if (image && image.width === width && image.height === height) return;
    small.width = width;
    small.height = height;
    image = source.createImageData(width, height);
    pixels = new Uint32Array(image.data.buffer);
  }

  return {
    canvas: canvas,

    /** Where the room lies in the window, in the page's units. */
    roomPlace: function () {
      const view = window.visualViewport;
      const rect = room.getBoundingClientRect();
      // What a phone's keyboard covers is no room.
      const bottom = view ? Math.min(rect.bottom, view.offsetTop + view.height) : rect.bottom;
      return { left: rect.left, top: rect.top, width: rect.width, height: Math.max(1, bottom - rect.top) };
    },

    /** Takes pixels of 0xAARRGGBB and shows them. */
    show: function (words, width, height) {
      keepSize(width, height);
      for (let i = 0; i < words.length; ++i) {
        const word = words[i];
        pixels[i] = (word & 0xff00ff00) | ((word >> 16) & 0xff) | ((word & 0xff) << 16);
      }
      source.putImageData(image, 0, 0);
      draw();
    },

    /** Puts the picture at these pixels of the room. */
    place: function (left, top, width, height) {
      const ratio = window.devicePixelRatio;
      place = { left: left, top: top, width: width, height: height };
      Object.entries(place).forEach(function (side) {
        // Browsers cut lengths down to such a part, and would miss the pixel of the display.
        table.style[side[0]] = Math.ceil(side[1] / ratio * 64) / 64 + 'px';
      });
      const multiple = Math.ceil(width / small.width);
      canvas.width = small.width * multiple;
      canvas.height = small.height * multiple;
      draw();
    },
  };
})();
