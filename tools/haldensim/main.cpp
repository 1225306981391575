// Being written: the simulator control tool.
int main() { return 2; }
