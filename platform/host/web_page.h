#pragma once

#include <cstdint>

// What the page's script does for the program, in editions/web/script/. Places and sizes are pixels
// of the display within the page's room for the picture. Texts are UTF-8; those that the script
// hands over are the program's to free.
extern "C" {

/// What happens on the page, in the order of `kinds` in the page's events.js.
enum PageEventKind : int {
  kPageRoom,  ///< the room has become x by y pixels
  kPageDown,
  kPageMove,
  kPageUp,
  kPageLeave,
  kPageWheel,
  kPageKey,   ///< the event's text is the chord
  kPageText,  ///< the event's text was typed
};

struct PageEvent {
  int kind;
  int x;
  int y;
  int wheel;   ///< notches, away from the person is positive
  int repeat;  ///< 1 for a key that is being held down
};

/// Takes the oldest event; 0: there is none.
int page_next_event(PageEvent* event);
/// The text of the event that was taken last.
char* page_event_text();
/// Returns when there is an event, inside the page's handler of it, so that the program may do what
/// takes a person's own act; or after so many milliseconds, below 0: never.
void page_wait(int milliseconds);

/// Keeps a picture of 0xAARRGGBB pixels, and shows it where page_place has put it.
void page_show(const std::uint32_t* pixels, int width, int height);
void page_place(int left, int top, int width, int height);

double page_ticks();
/// Year, month and day from 1, hour, minute, second.
void page_local_time(int* six);

/// Text is wanted in these pixels of the picture.
void page_want_text(int left, int top, int width, int height);
void page_want_no_text();
/// What was pasted last.
char* page_clipboard();
void page_set_clipboard(const char* text);
void page_say(const char* text);
/// Opens a page beside this one; 0 where the browser does not let it.
int page_open(const char* address);
/// The program has ended.
void page_end();

}  // extern "C"
