// Being written: the command-line tool.
int main() { return 2; }
