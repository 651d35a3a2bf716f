/// Ends by a fault.
int main() {
    volatile int* volatile nothing = nullptr;
    *nothing = 0;
    return 0;
}
