
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity attributes is
   port ( A : in    std_logic; 
          Y : out   std_logic_vector (3 downto 0));
   attribute PULL : string ;
   attribute PIN_NO : integer ;
   attribute PULL of A : signal is "up";
   attribute PIN_NO of A : signal is 12;
   attribute IOSTD of A : signal is "LVCMOS";
   attribute PIN_NO of Y : signal is 13;
end attributes;

architecture BEHAVIORAL of attributes is
   attribute NOTE     : string ;
   attribute KEEP     : boolean ;
   attribute RATIO    : real ;
   attribute MASK     : bit_vector ;
   attribute EDGE     : bit ;
   attribute MODE     : speed_t ;
   attribute SPEED    : string ;
   attribute AREA     : integer ;
   attribute LOC      : string ;
   attribute BOX_TYPE : string ;
   signal B     : std_logic_vector (3 downto 0);
   signal N     : std_logic;
   signal PLAIN : std_logic;
   component MEM
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   attribute SPEED of MEM : component is "fast";
   attribute AREA of MEM : component is 3;
   
   component CELL
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   attribute BOX_TYPE of CELL : component is "BLACK_BOX";
   
   attribute NOTE of B : signal is "";
   attribute KEEP of N : signal is TRUE;
   attribute pull of N : signal is "down";
   attribute RATIO of N : signal is 2.50;
   attribute MASK of N : signal is b"1010";
   attribute EDGE of N : signal is '1';
   attribute MODE of N : signal is FAST;
   attribute SPEED of U2 : label is "slow";
   attribute LOC of U2 : label is "R1C1";
   attribute IOSTD of U2 : label is "LVTTL";
begin
   Y(3) <= B(3);
   U1 : MEM
      port map (A=>A,
                O=>N);
   
   U2 : MEM
      port map (A=>N,
                O=>Y(0));
   
   U3 : CELL
      port map (A=>N,
                O=>Y(1));
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_attributes of  attributes is
   for BEHAVIORAL
      for U1, U2 : MEM
         use configuration WORK.CFG_MEM;
      end for;
   end for;
end CFG_attributes;
-- synopsys translate_on

