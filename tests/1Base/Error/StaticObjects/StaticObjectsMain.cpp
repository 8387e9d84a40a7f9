#include <cstdio>

int main() {
    std::puts("main");
}
