// The texts that a virtual machine takes.
#ifndef QUORVANE_JNI_MODIFIED_UTF8_H_
#define QUORVANE_JNI_MODIFIED_UTF8_H_

// Turns every byte of the terminated `text` that belongs to no sequence of modified UTF-8 into '?',
// in place; the length stays. Sequences have one byte (01-7F), two (C0-DF and one of 80-BF), three
// (E0-EF and two), or four (F0-F7 and three), which Android lends and takes back for rare
// characters.
//
// A result may hold parts of a character: fields are cut by bytes, dates taken apart, character
// arguments have eight bits. A checked machine ends the app for such a text, and older ones read on
// behind its end.
void MendModifiedUtf8(char* text);

#endif  // QUORVANE_JNI_MODIFIED_UTF8_H_
