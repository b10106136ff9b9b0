`timescale 1ns / 1ps

module w(A);

    input A;
   
   
endmodule
////////////////////////////////////////////////////////////////////////////////
// Copyright (c) Orvane. All rights reserved.
////////////////////////////////////////////////////////////////////////////////
//##          ##
//###        ###
// ###      ###   Vendor: Orvane 
//  ###    ###    Version : 0.1.0
//   ###  ###     Application : 
//    ######      Filename : appended.v
//     ####       Timestamp : MM/DD/YYYY hh:mm:ss
//  ===========
// =============
//
//Command: 
//Design Name: w
//
`timescale 1ns / 1ps

module w(A);

    input A;
   
   
endmodule
