/*
 * Takes the dynamic linker a twentieth of a second to link. The linker says what that is in its own cycles, of which
 * some versions print a tenth.
 */
#include <sys/syscall.h>
#include <time.h>

static int nothing(void)
{
    return 0;
}

/* Called while the program is being linked, when no library can be used yet. */
static int (*slowly(void))(void)
{
    const struct timespec duration = {0, 50 * 1000 * 1000};
    long result = SYS_nanosleep;
    __asm__ volatile("syscall" : "+a"(result) : "D"(&duration), "S"(0) : "rcx", "r11", "memory");
    return nothing;
}

static int linked(void) __attribute__((ifunc("slowly")));

int main(void)
{
    return linked();
}
