-- The cells of the designs in golden/ and examples/. They have ports and no function; a written configuration
-- binds each of them by the configuration CFG_<cell>.
library ieee;
use ieee.std_logic_1164.all;
entity AND2 is
    port (I0, I1 : in std_logic; O : out std_logic);
end AND2;
architecture EMPTY of AND2 is begin end EMPTY;
configuration CFG_AND2 of AND2 is for EMPTY end for; end CFG_AND2;

library ieee;
use ieee.std_logic_1164.all;
entity BUF4 is
    port (D : in std_logic_vector(3 downto 0); Q : out std_logic_vector(3 downto 0));
end BUF4;
architecture EMPTY of BUF4 is begin end EMPTY;
configuration CFG_BUF4 of BUF4 is for EMPTY end for; end CFG_BUF4;

library ieee;
use ieee.std_logic_1164.all;
entity UP4 is
    port (D : in std_logic_vector(0 to 3); Q : out std_logic_vector(0 to 3));
end UP4;
architecture EMPTY of UP4 is begin end EMPTY;
configuration CFG_UP4 of UP4 is for EMPTY end for; end CFG_UP4;

library ieee;
use ieee.std_logic_1164.all;
entity REG8 is
    port (
        C : in std_logic;
        D : in std_logic_vector(7 downto 0);
        Q : out std_logic_vector(7 downto 0)
    );
end REG8;
architecture EMPTY of REG8 is begin end EMPTY;
configuration CFG_REG8 of REG8 is for EMPTY end for; end CFG_REG8;

library ieee;
use ieee.std_logic_1164.all;
entity ONE is
    port (G : in std_logic_vector(0 downto 0));
end ONE;
architecture EMPTY of ONE is begin end EMPTY;
configuration CFG_ONE of ONE is for EMPTY end for; end CFG_ONE;

library ieee;
use ieee.std_logic_1164.all;
entity PAD is
    port (I : in std_logic; IO : inout std_logic);
end PAD;
architecture EMPTY of PAD is begin end EMPTY;
configuration CFG_PAD of PAD is for EMPTY end for; end CFG_PAD;

library ieee;
use ieee.std_logic_1164.all;
library KORBAL;
use KORBAL.Kelements.all;
entity MEM is
    generic (
        DEPTH : integer := 1;
        TITLE : string := "";
        MASK : bit_vector := x"00";
        MODE : speed_t := SLOW;
        DELAY : real := 1.0;
        CHECK : boolean := false
    );
    port (A : in std_logic; O : out std_logic);
end MEM;
architecture EMPTY of MEM is begin end EMPTY;
configuration CFG_MEM of MEM is for EMPTY end for; end CFG_MEM;

library ieee;
use ieee.std_logic_1164.all;
entity DLY is
    generic (T : real := 1.0);
    port (A : in std_logic; O : out std_logic);
end DLY;
architecture EMPTY of DLY is begin end EMPTY;
configuration CFG_DLY of DLY is for EMPTY end for; end CFG_DLY;

library ieee;
use ieee.std_logic_1164.all;
entity CELL is
    port (A : in std_logic; O : out std_logic);
end CELL;
architecture EMPTY of CELL is begin end EMPTY;

library ieee;
use ieee.std_logic_1164.all;
entity MIX is
    port (I0, I1 : in std_logic; O : out std_logic_vector(2 downto 0));
end MIX;
architecture EMPTY of MIX is begin end EMPTY;
configuration CFG_MIX of MIX is for EMPTY end for; end CFG_MIX;

library ieee;
use ieee.std_logic_1164.all;
entity TITLED is
    generic (TITLE : string := "");
    port (I : in std_logic; O : out std_logic);
end TITLED;
architecture EMPTY of TITLED is begin end EMPTY;
configuration CFG_TITLED of TITLED is for EMPTY end for; end CFG_TITLED;

library ieee;
use ieee.std_logic_1164.all;
entity INV is
    port (I : in std_logic; O : out std_logic);
end INV;
architecture EMPTY of INV is begin end EMPTY;
configuration CFG_INV of INV is for EMPTY end for; end CFG_INV;

library ieee;
use ieee.std_logic_1164.all;
entity XOR2 is
    port (I0, I1 : in std_logic; O : out std_logic);
end XOR2;
architecture EMPTY of XOR2 is begin end EMPTY;
configuration CFG_XOR2 of XOR2 is for EMPTY end for; end CFG_XOR2;

library ieee;
use ieee.std_logic_1164.all;
entity DFF is
    port (C, D : in std_logic; Q : out std_logic);
end DFF;
architecture EMPTY of DFF is begin end EMPTY;
configuration CFG_DFF of DFF is for EMPTY end for; end CFG_DFF;

library ieee;
use ieee.std_logic_1164.all;
entity LUT2 is
    generic (INIT : integer := 0);
    port (I0, I1 : in std_logic; O : out std_logic);
end LUT2;
architecture EMPTY of LUT2 is begin end EMPTY;
configuration CFG_LUT2 of LUT2 is for EMPTY end for; end CFG_LUT2;

library ieee;
use ieee.std_logic_1164.all;
entity ADD4 is
    port (
        A, B : in std_logic_vector(3 downto 0);
        CI : in std_logic;
        S : out std_logic_vector(3 downto 0);
        CO : out std_logic
    );
end ADD4;
architecture EMPTY of ADD4 is begin end EMPTY;
configuration CFG_ADD4 of ADD4 is for EMPTY end for; end CFG_ADD4;

library ieee;
use ieee.std_logic_1164.all;
entity REG9 is
    port (
        C : in std_logic;
        D : in std_logic_vector(8 downto 0);
        Q : out std_logic_vector(8 downto 0)
    );
end REG9;
architecture EMPTY of REG9 is begin end EMPTY;
configuration CFG_REG9 of REG9 is for EMPTY end for; end CFG_REG9;
