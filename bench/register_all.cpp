// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerPeers();

void registerAll()
{
    registerConvFamilies();
    registerPeers();
}
} // namespace zb
