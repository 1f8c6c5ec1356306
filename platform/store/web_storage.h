#pragma once

// What the page's script does for the profile, in editions/web/script/storage.js. Texts are UTF-8.
extern "C" {

/// All that is stored under names with this beginning: the rest of a name, its value, and so on,
/// each with a zero byte behind it, an empty name at the end; the program's to free. Null where the
/// browser keeps nothing for this page.
char* page_stored(const char* beginning);

/// Stores such a list under names with this beginning: all of it, or nothing and 0.
int page_store(const char* beginning, const char* list);

}  // extern "C"
