/* Test-only preload: steps the wall clock of the program it is loaded
 * into. While the file named by TULK_TEST_CLOCK_STEP_FILE exists, the
 * seconds it holds (negative to step back) are added to every reading of
 * the wall clock (gettimeofday, time, the realtime clocks of
 * clock_gettime); every other clock is left alone. A screen test writes the
 * file while the console waits, as NTP or an operator setting the date
 * would step the clock. */

#define _GNU_SOURCE
#include <dlfcn.h>
#include <stdio.h>
#include <stdlib.h>
#include <sys/time.h>
#include <time.h>

typedef int (*ClockGettime)(clockid_t, struct timespec*);

static ClockGettime RealClockGettime(void) {
  static ClockGettime real = NULL;
  if (real == NULL) {
    real = (ClockGettime)dlsym(RTLD_NEXT, "clock_gettime");
  }
  return real;
}

static long StepSeconds(void) {
  const char* path = getenv("TULK_TEST_CLOCK_STEP_FILE");
  if (path == NULL) {
    return 0;
  }
  FILE* file = fopen(path, "r");
  if (file == NULL) {
    return 0;
  }
  long seconds = 0;
  if (fscanf(file, "%ld", &seconds) != 1) {
    seconds = 0;
  }
  fclose(file);
  return seconds;
}

int clock_gettime(clockid_t clock, struct timespec* now) {
  int rc = RealClockGettime()(clock, now);
  if (rc == 0 && (clock == CLOCK_REALTIME || clock == CLOCK_REALTIME_COARSE)) {
    now->tv_sec += StepSeconds();
  }
  return rc;
}

int gettimeofday(struct timeval* restrict now, void* restrict zone) {
  (void)zone;
  struct timespec real;
  int rc = RealClockGettime()(CLOCK_REALTIME, &real);
  if (rc == 0 && now != NULL) {
    now->tv_sec = real.tv_sec + StepSeconds();
    now->tv_usec = real.tv_nsec / 1000;
  }
  return rc;
}

time_t time(time_t* out) {
  struct timespec real;
  RealClockGettime()(CLOCK_REALTIME, &real);
  time_t now = real.tv_sec + StepSeconds();
  if (out != NULL) {
    *out = now;
  }
  return now;
}
