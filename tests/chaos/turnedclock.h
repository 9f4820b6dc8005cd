#pragma once

/**
 * The clock on the wall, as this process and those that it starts see it; everything else that measures time goes on.
 *
 * Part of a test's program, and loaded before all libraries into what it starts. The processes share the turn through
 * the file that is named by "FAVRIN_TEST_CLOCK" in their environment.
 */
class TurnedClock
{
public:
    /** Makes @p file, and names it to the processes that are started later. */
    explicit TurnedClock(const char *file);
    /** From the true time. */
    static void turn(long long seconds);
};
