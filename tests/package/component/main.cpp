// A program that links the component without using it.
int main()
{
    return 0;
}
