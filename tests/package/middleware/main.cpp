// A program that knows the middleware only.
int Pauses();

int main()
{
    return Pauses() == 1 ? 0 : 1;
}
