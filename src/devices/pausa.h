#pragma once

namespace brasel::devices {

// Waits `segundos` seconds on the monotonic clock (a change of date or of the wall clock does
// not stretch or cut it). With an event loop, timers and screens keep running meanwhile;
// without one the thread sleeps. Nothing spins a processor core.
void Pausa(int segundos);

}  // namespace brasel::devices
