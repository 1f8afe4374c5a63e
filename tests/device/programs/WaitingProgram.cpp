#include <unistd.h>

/// Does nothing until it is ended, whatever it is given.
int main() {
    for (;;)
        pause();
}
