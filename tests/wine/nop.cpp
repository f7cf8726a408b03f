// Returns once Wine is up.
int main() {}
